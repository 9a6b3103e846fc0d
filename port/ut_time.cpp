#include "port/ut_time.h"

#include <ctime>

int64_t UT_TIME::Time() { return static_cast<int64_t>(std::time(nullptr)); }

Port_String UT_TIME::CTime(int64_t t) {
    std::time_t tt = static_cast<std::time_t>(t);
    std::tm tmv;
    char buf[64];
    if (!localtime_r(&tt, &tmv) || !std::strftime(buf, sizeof buf, "%a %b %e %H:%M:%S %Y", &tmv)) return Port_String();
    return Port_String(buf);
}
