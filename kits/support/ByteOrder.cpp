// SPDX-License-Identifier: MIT
// Swapping the bytes of values.

#include <ByteOrder.h>

#include <string.h>

#include <algorithm>

namespace {

/// The bytes that are swapped with each other in data of a type; 0 for one that is never swapped.
size_t
swapped_size(type_code type)
{
	switch (type) {
		case B_BOOL_TYPE:
		case B_CHAR_TYPE:
		case B_COLOR_8_BIT_TYPE:
		case B_GRAYSCALE_8_BIT_TYPE:
		case B_INT8_TYPE:
		case B_UINT8_TYPE:
		case B_STRING_TYPE:
		case B_ASCII_TYPE:
		case B_MIME_TYPE:
		case B_MIME_STRING_TYPE:
		case B_RGB_COLOR_TYPE:
			return 1;
		case B_INT16_TYPE:
		case B_UINT16_TYPE:
			return 2;
		case B_INT32_TYPE:
		case B_UINT32_TYPE:
		case B_FLOAT_TYPE:
		case B_POINT_TYPE:
		case B_RECT_TYPE:
		case B_SIZE_TYPE:
		case B_TIME_TYPE:
			return 4;
		case B_INT64_TYPE:
		case B_UINT64_TYPE:
		case B_DOUBLE_TYPE:
		case B_OFF_T_TYPE:
		case B_SIZE_T_TYPE:
		case B_SSIZE_T_TYPE:
		case B_POINTER_TYPE:
			return 8;
		default:
			return 0;
	}
}

} // namespace


float
__swap_float(float arg)
{
	uint32 bits;
	memcpy(&bits, &arg, sizeof(bits));
	bits = B_SWAP_INT32(bits);
	memcpy(&arg, &bits, sizeof(bits));
	return arg;
}


double
__swap_double(double arg)
{
	uint64 bits;
	memcpy(&bits, &arg, sizeof(bits));
	bits = B_SWAP_INT64(bits);
	memcpy(&arg, &bits, sizeof(bits));
	return arg;
}


status_t
swap_data(type_code type, void* data, size_t length, swap_action action)
{
	size_t size = swapped_size(type);
	if (size == 0 || length % size != 0 || (data == nullptr && length > 0))
		return B_BAD_VALUE;

	bool toLittle = action == B_SWAP_HOST_TO_LENDIAN || action == B_SWAP_LENDIAN_TO_HOST;
	bool toBig = action == B_SWAP_HOST_TO_BENDIAN || action == B_SWAP_BENDIAN_TO_HOST;
	if ((toLittle && B_HOST_IS_LENDIAN) || (toBig && B_HOST_IS_BENDIAN))
		return B_OK;

	char* bytes = static_cast<char*>(data);
	for (size_t i = 0; i < length; i += size)
		std::reverse(bytes + i, bytes + i + size);
	return B_OK;
}


bool
is_type_swapped(type_code type)
{
	return swapped_size(type) != 0;
}
