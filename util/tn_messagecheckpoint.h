// The error and warning counts at a point in time: phases compare the
// dispatcher's counts against it instead of counting anything themselves.
#ifndef TARN_TN_MESSAGECHECKPOINT_H
#define TARN_TN_MESSAGECHECKPOINT_H

#include <cstdint>

class Tn_MessageCheckpoint {
public:
    Tn_MessageCheckpoint() { reset(); }
    void reset();
    bool warningsIssued() const { return warningCount() > 0; }
    bool errorsIssued() const { return errorCount() > 0; }
    int32_t warningCount() const;
    int32_t errorCount() const;

private:
    int32_t warnings_;
    int32_t errors_;
};

#endif
