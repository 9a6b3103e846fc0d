/* Value and error records of the design-access interface, laid out as the
   IEEE 1364 VPI records of the same names. */
#ifndef TARN_TN_VPIUSER_H
#define TARN_TN_VPIUSER_H

#include <stdint.h>

typedef struct t_vpi_vecval {
    int32_t aval, bval;
} s_vpi_vecval, *p_vpi_vecval;

typedef struct t_vpi_strengthval {
    int32_t logic, s0, s1;
} s_vpi_strengthval, *p_vpi_strengthval;

typedef struct t_vpi_time {
    int32_t type;
    uint32_t high, low;
    double real;
} s_vpi_time, *p_vpi_time;

typedef struct t_vpi_value {
    int32_t format;
    union {
        char* str;
        int32_t scalar;
        int32_t integer;
        double real;
        struct t_vpi_time* time;
        struct t_vpi_vecval* vector;
        struct t_vpi_strengthval* strength;
        char* misc;
    } value;
} s_vpi_value, *p_vpi_value;

typedef struct t_vpi_error_info {
    int32_t state;
    int32_t level;
    char* message;
    char* product;
    char* code;
    char* file;
    int32_t line;
} s_vpi_error_info, *p_vpi_error_info;

#endif
