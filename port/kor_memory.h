// Raw memory of the portability layer, with the meaning of the C functions.
#ifndef TARN_KOR_MEMORY_H
#define TARN_KOR_MEMORY_H

#include <cstddef>

void* kor_malloc(size_t size);
void* kor_realloc(void* p, size_t size);
void kor_free(void* p);

// A block for a pool that lives as long as the process (never freed):
// page aligned, and backed by huge pages where the system offers them, so
// that filling it costs few page faults. Null when memory is exhausted.
void* kor_allocBlock(size_t size);

#endif
