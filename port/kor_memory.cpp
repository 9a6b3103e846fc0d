#include "port/kor_memory.h"

#include <cstdlib>

void* kor_malloc(size_t size) { return std::malloc(size ? size : 1); }

void* kor_realloc(void* p, size_t size) { return std::realloc(p, size ? size : 1); }

void kor_free(void* p) { std::free(p); }
