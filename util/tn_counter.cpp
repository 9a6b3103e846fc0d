#include "util/tn_counter.h"

Tn_Counter::~Tn_Counter() {}

Tn_CounterPtr Tn_Counter::create(int32_t first, int32_t last) {
    if (first <= last) return Tn_CounterPtr(new Tn_UpCounter(first, last));
    return Tn_CounterPtr(new Tn_DownCounter(first, last));
}

Tn_CounterPtr Tn_Counter::createPair(const Tn_CounterPtr& outer, const Tn_CounterPtr& inner) {
    return Tn_CounterPtr(new Tn_PairCounter(outer, inner));
}

bool Tn_RangeCounter::step(int32_t direction) {
    if (direction > 0 ? current_ >= last_ : current_ <= last_) {
        current_ = first_;
        return false;
    }
    current_ += direction;
    return true;
}

bool Tn_PairCounter::next() { return inner_->next() || outer_->next(); }

std::vector<int32_t> Tn_PairCounter::values() const {
    std::vector<int32_t> v = outer_->values();
    const std::vector<int32_t> in = inner_->values();
    v.insert(v.end(), in.begin(), in.end());
    return v;
}
