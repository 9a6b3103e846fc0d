#include "util/tn_messagecheckpoint.h"

#include "tarn/port_msgmandata.h"

void Tn_MessageCheckpoint::reset() {
    warnings_ = Port_MsgDispatcher::getWarnCount(false);
    errors_ = Port_MsgDispatcher::getErrCount(false);
}

int32_t Tn_MessageCheckpoint::warningCount() const { return Port_MsgDispatcher::getWarnCount(false) - warnings_; }

int32_t Tn_MessageCheckpoint::errorCount() const { return Port_MsgDispatcher::getErrCount(false) - errors_; }
