#include "util/tn_exception.h"

Tn_Exception::~Tn_Exception() {}
