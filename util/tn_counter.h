// Index counters over ranges. Up and down counters walk one range and wrap;
// nesting pair counters gives an odometer over any number of dimensions.
#ifndef TARN_TN_COUNTER_H
#define TARN_TN_COUNTER_H

#include <cstdint>
#include <vector>

#include "tarn/tn_rcobject.h"
#include "tarn/tn_rcptr.h"

class Tn_Counter;
typedef Tn::RCPtr<Tn_Counter> Tn_CounterPtr;

class Tn_Counter : public Tn::RCObject {
public:
    ~Tn_Counter() override;
    // Advances; false (and back at the first position) when it wrapped.
    virtual bool next() = 0;
    virtual std::vector<int32_t> values() const = 0;

    // An up counter when first <= last, else a down counter; starts at first.
    static Tn_CounterPtr create(int32_t first, int32_t last);
    // Odometer over outer (slow) and inner (fast); shares both.
    static Tn_CounterPtr createPair(const Tn_CounterPtr& outer, const Tn_CounterPtr& inner);
};

// A counter over one range [first, last]; subclasses step it.
class Tn_RangeCounter : public Tn_Counter {
public:
    std::vector<int32_t> values() const override { return {current_}; }

protected:
    Tn_RangeCounter(int32_t first, int32_t last) : current_(first), first_(first), last_(last) {}
    // Moves current one step towards last; at last, back to first and false.
    bool step(int32_t direction);

private:
    int32_t current_, first_, last_;
};

class Tn_UpCounter : public Tn_RangeCounter {
public:
    Tn_UpCounter(int32_t first, int32_t last) : Tn_RangeCounter(first, last) {}
    bool next() override { return step(1); }
};

class Tn_DownCounter : public Tn_RangeCounter {
public:
    Tn_DownCounter(int32_t first, int32_t last) : Tn_RangeCounter(first, last) {}
    bool next() override { return step(-1); }
};

class Tn_PairCounter : public Tn_Counter {
public:
    Tn_PairCounter(const Tn_CounterPtr& outer, const Tn_CounterPtr& inner) : outer_(outer), inner_(inner) {}
    bool next() override;
    std::vector<int32_t> values() const override;

private:
    Tn_CounterPtr outer_, inner_;
};

#endif
