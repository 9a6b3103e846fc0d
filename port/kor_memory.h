// Raw memory of the portability layer, with the meaning of the C functions.
#ifndef TARN_KOR_MEMORY_H
#define TARN_KOR_MEMORY_H

#include <cstddef>

void* kor_malloc(size_t size);
void* kor_realloc(void* p, size_t size);
void kor_free(void* p);

#endif
