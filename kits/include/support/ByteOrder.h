// SPDX-License-Identifier: MIT
// Byte order: conversion between the host's and a given one.

#ifndef _BYTE_ORDER_H
#define _BYTE_ORDER_H

#include <endian.h>

#include <SupportDefs.h>
#include <TypeConstants.h>

typedef enum {
	B_SWAP_HOST_TO_LENDIAN,
	B_SWAP_HOST_TO_BENDIAN,
	B_SWAP_LENDIAN_TO_HOST,
	B_SWAP_BENDIAN_TO_HOST,
	B_SWAP_ALWAYS
} swap_action;

#if __BYTE_ORDER == __LITTLE_ENDIAN
#define B_HOST_IS_LENDIAN 1
#define B_HOST_IS_BENDIAN 0
#else
#define B_HOST_IS_LENDIAN 0
#define B_HOST_IS_BENDIAN 1
#endif

#define B_SWAP_INT16(arg) __builtin_bswap16(arg)
#define B_SWAP_INT32(arg) __builtin_bswap32(arg)
#define B_SWAP_INT64(arg) __builtin_bswap64(arg)
#define B_SWAP_FLOAT(arg) __swap_float(arg)
#define B_SWAP_DOUBLE(arg) __swap_double(arg)

double __swap_double(double arg);
float __swap_float(float arg);

#if B_HOST_IS_LENDIAN
#define B_HOST_TO_LENDIAN_INT16(arg) ((uint16)(arg))
#define B_HOST_TO_LENDIAN_INT32(arg) ((uint32)(arg))
#define B_HOST_TO_LENDIAN_INT64(arg) ((uint64)(arg))
#define B_HOST_TO_LENDIAN_FLOAT(arg) ((float)(arg))
#define B_HOST_TO_LENDIAN_DOUBLE(arg) ((double)(arg))
#define B_HOST_TO_BENDIAN_INT16(arg) B_SWAP_INT16(arg)
#define B_HOST_TO_BENDIAN_INT32(arg) B_SWAP_INT32(arg)
#define B_HOST_TO_BENDIAN_INT64(arg) B_SWAP_INT64(arg)
#define B_HOST_TO_BENDIAN_FLOAT(arg) B_SWAP_FLOAT(arg)
#define B_HOST_TO_BENDIAN_DOUBLE(arg) B_SWAP_DOUBLE(arg)
#else
#define B_HOST_TO_LENDIAN_INT16(arg) B_SWAP_INT16(arg)
#define B_HOST_TO_LENDIAN_INT32(arg) B_SWAP_INT32(arg)
#define B_HOST_TO_LENDIAN_INT64(arg) B_SWAP_INT64(arg)
#define B_HOST_TO_LENDIAN_FLOAT(arg) B_SWAP_FLOAT(arg)
#define B_HOST_TO_LENDIAN_DOUBLE(arg) B_SWAP_DOUBLE(arg)
#define B_HOST_TO_BENDIAN_INT16(arg) ((uint16)(arg))
#define B_HOST_TO_BENDIAN_INT32(arg) ((uint32)(arg))
#define B_HOST_TO_BENDIAN_INT64(arg) ((uint64)(arg))
#define B_HOST_TO_BENDIAN_FLOAT(arg) ((float)(arg))
#define B_HOST_TO_BENDIAN_DOUBLE(arg) ((double)(arg))
#endif

#define B_LENDIAN_TO_HOST_INT16(arg) B_HOST_TO_LENDIAN_INT16(arg)
#define B_LENDIAN_TO_HOST_INT32(arg) B_HOST_TO_LENDIAN_INT32(arg)
#define B_LENDIAN_TO_HOST_INT64(arg) B_HOST_TO_LENDIAN_INT64(arg)
#define B_LENDIAN_TO_HOST_FLOAT(arg) B_HOST_TO_LENDIAN_FLOAT(arg)
#define B_LENDIAN_TO_HOST_DOUBLE(arg) B_HOST_TO_LENDIAN_DOUBLE(arg)
#define B_BENDIAN_TO_HOST_INT16(arg) B_HOST_TO_BENDIAN_INT16(arg)
#define B_BENDIAN_TO_HOST_INT32(arg) B_HOST_TO_BENDIAN_INT32(arg)
#define B_BENDIAN_TO_HOST_INT64(arg) B_HOST_TO_BENDIAN_INT64(arg)
#define B_BENDIAN_TO_HOST_FLOAT(arg) B_HOST_TO_BENDIAN_FLOAT(arg)
#define B_BENDIAN_TO_HOST_DOUBLE(arg) B_HOST_TO_BENDIAN_DOUBLE(arg)

/// Swaps in place the \a length bytes of \a data, which are values of \a type one after another.
///
/// Returns B_OK, also when nothing needs swapping; B_BAD_VALUE for a type that cannot be swapped,
/// a null pointer, or a length that is no whole number of values. Nothing is changed then.
status_t swap_data(type_code type, void* data, size_t length, swap_action action);

/// Whether swap_data() knows \a type.
bool is_type_swapped(type_code type);

#endif // _BYTE_ORDER_H
