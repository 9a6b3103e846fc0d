// How Tarn issues a message: a message object naming the facility, the
// issuing source file and line, then issueError/Warning/Status/Internal.
#ifndef TARN_TN_MESSAGE_H
#define TARN_TN_MESSAGE_H

#include "tarn/port_msgmandata.h"

#define TN_FACILITY "ZORIveravaro"
#define TN_REVISION "$Revision: 0.1 $"

// TN_MSG().issueError("...\n", ...): __FILE__ is build-tree relative
// ("src/tn_optionstream.cpp"); the message layer drops the extension.
#define TN_MSG() Port_MsgManData::createObject(TN_FACILITY, __FILE__, __LINE__, TN_REVISION)

#endif
