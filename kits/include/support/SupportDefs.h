// SPDX-License-Identifier: MIT
// The API's basic types, formats for printing them, and the atomic operations.

#ifndef _SUPPORT_DEFS_H
#define _SUPPORT_DEFS_H

#include <inttypes.h>
#include <stddef.h>
#include <stdint.h>
#include <sys/types.h>

#include <Errors.h>

typedef int8_t int8;
typedef int16_t int16;
typedef int32_t int32;
typedef int64_t int64;
typedef uint8_t uint8;
typedef uint16_t uint16;
typedef uint32_t uint32;
typedef uint64_t uint64;

typedef volatile int8 vint8;
typedef volatile int16 vint16;
typedef volatile int32 vint32;
typedef volatile int64 vint64;
typedef volatile uint8 vuint8;
typedef volatile uint16 vuint16;
typedef volatile uint32 vuint32;
typedef volatile uint64 vuint64;

typedef volatile long vlong;
typedef volatile int vint;
typedef volatile short vshort;
typedef volatile char vchar;
typedef volatile unsigned long vulong;
typedef volatile unsigned int vuint;
typedef volatile unsigned short vushort;
typedef volatile unsigned char vuchar;

typedef unsigned char uchar;
typedef unsigned short unichar;

/// B_OK, or a negative code of Errors.h.
typedef int32 status_t;
/// Microseconds.
typedef int64 bigtime_t;
typedef int64 nanotime_t;
/// A code of TypeConstants.h, or a program's own.
typedef uint32 type_code;
typedef uint32 perform_code;
typedef uintptr_t addr_t;

#define B_PRId8 PRId8
#define B_PRIi8 PRIi8
#define B_PRIu8 PRIu8
#define B_PRIx8 PRIx8
#define B_PRIX8 PRIX8
#define B_PRId16 PRId16
#define B_PRIi16 PRIi16
#define B_PRIu16 PRIu16
#define B_PRIx16 PRIx16
#define B_PRIX16 PRIX16
#define B_PRId32 PRId32
#define B_PRIi32 PRIi32
#define B_PRIu32 PRIu32
#define B_PRIx32 PRIx32
#define B_PRIX32 PRIX32
#define B_PRId64 PRId64
#define B_PRIi64 PRIi64
#define B_PRIu64 PRIu64
#define B_PRIx64 PRIx64
#define B_PRIX64 PRIX64
#define B_PRIdSSIZE "zd"
#define B_PRIuSIZE "zu"
#define B_PRIxSIZE "zx"
#define B_PRIdOFF PRId64
#define B_PRIdBIGTIME PRId64
#define B_PRIxADDR PRIxPTR
#define B_PRIuADDR PRIuPTR

#define B_EMPTY_STRING ""

#ifndef min_c
#define min_c(a, b) ((a) > (b) ? (b) : (a))
#endif
#ifndef max_c
#define max_c(a, b) ((a) > (b) ? (a) : (b))
#endif

/// The number of elements of an array (not of a pointer).
#define B_COUNT_OF(array) (sizeof(array) / sizeof((array)[0]))

#ifndef FALSE
#define FALSE 0
#endif
#ifndef TRUE
#define TRUE 1
#endif

// Every atomic operation but the setters returns the value from before. All are full barriers.

static inline void
atomic_set(int32* value, int32 newValue)
{
	__atomic_store_n(value, newValue, __ATOMIC_SEQ_CST);
}


/// Stores \a newValue when the value is \a testAgainst.
static inline int32
atomic_test_and_set(int32* value, int32 newValue, int32 testAgainst)
{
	__atomic_compare_exchange_n(
		value, &testAgainst, newValue, false, __ATOMIC_SEQ_CST, __ATOMIC_SEQ_CST);
	return testAgainst;
}


static inline int32
atomic_get_and_set(int32* value, int32 newValue)
{
	return __atomic_exchange_n(value, newValue, __ATOMIC_SEQ_CST);
}


static inline int32
atomic_add(int32* value, int32 addValue)
{
	return __atomic_fetch_add(value, addValue, __ATOMIC_SEQ_CST);
}


static inline int32
atomic_and(int32* value, int32 andValue)
{
	return __atomic_fetch_and(value, andValue, __ATOMIC_SEQ_CST);
}


static inline int32
atomic_or(int32* value, int32 orValue)
{
	return __atomic_fetch_or(value, orValue, __ATOMIC_SEQ_CST);
}


static inline int32
atomic_get(int32* value)
{
	return __atomic_load_n(value, __ATOMIC_SEQ_CST);
}


static inline void
atomic_set64(int64* value, int64 newValue)
{
	__atomic_store_n(value, newValue, __ATOMIC_SEQ_CST);
}


static inline int64
atomic_test_and_set64(int64* value, int64 newValue, int64 testAgainst)
{
	__atomic_compare_exchange_n(
		value, &testAgainst, newValue, false, __ATOMIC_SEQ_CST, __ATOMIC_SEQ_CST);
	return testAgainst;
}


static inline int64
atomic_get_and_set64(int64* value, int64 newValue)
{
	return __atomic_exchange_n(value, newValue, __ATOMIC_SEQ_CST);
}


static inline int64
atomic_add64(int64* value, int64 addValue)
{
	return __atomic_fetch_add(value, addValue, __ATOMIC_SEQ_CST);
}


static inline int64
atomic_and64(int64* value, int64 andValue)
{
	return __atomic_fetch_and(value, andValue, __ATOMIC_SEQ_CST);
}


static inline int64
atomic_or64(int64* value, int64 orValue)
{
	return __atomic_fetch_or(value, orValue, __ATOMIC_SEQ_CST);
}


static inline int64
atomic_get64(int64* value)
{
	return __atomic_load_n(value, __ATOMIC_SEQ_CST);
}

#endif // _SUPPORT_DEFS_H
