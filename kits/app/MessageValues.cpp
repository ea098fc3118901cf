// SPDX-License-Identifier: MIT
// Fields of one size: numbers, booleans, points, rectangles, sizes, colours and pointers.

#include <Message.h>

#include <cstring>

#include <Errors.h>
#include <GraphicsDefs.h>
#include <Point.h>
#include <Size.h>

#include "app/MessageBody.h"

/// Copies an item of exactly \a size bytes; \a value stays as it is on failure.
status_t
BMessage::FindValue(const char* name, type_code type, int32 index, void* value, size_t size) const
{
	if (value == nullptr)
		return B_BAD_VALUE;

	int32 field;
	status_t status = FindField(name, type, &field);
	if (status != B_OK)
		return status;
	const uint8* data;
	uint32 found;
	status = FindItem(field, index, &data, &found);
	if (status != B_OK)
		return status;
	if (found != size)
		return B_BAD_DATA;

	// A damaged file can hold any byte here, and a bool can hold only two.
	if (type == B_BOOL_TYPE)
		*static_cast<bool*>(value) = *data != 0;
	else
		memcpy(value, data, size);
	return B_OK;
}


bool
BMessage::HasValue(const char* name, type_code type, int32 index, size_t size) const
{
	int32 field;
	const uint8* data;
	uint32 found;
	return FindField(name, type, &field) == B_OK && FindItem(field, index, &data, &found) == B_OK
		&& found == size;
}


// Every line of the family for one type: Type is the value, TypeRef how a default is passed.
// NOLINTBEGIN(bugprone-macro-parentheses): a type cannot stand in parentheses.
#define DEFINE_VALUE(Name, Type, TypeRef, code)                                                    \
	status_t BMessage::Add##Name(const char* name, Type value)                                     \
	{                                                                                              \
		return AddData(name, code, &value, sizeof(value), true);                                   \
	}                                                                                              \
                                                                                                   \
	status_t BMessage::Replace##Name(const char* name, Type value)                                 \
	{                                                                                              \
		return ReplaceData(name, code, 0, &value, sizeof(value));                                  \
	}                                                                                              \
                                                                                                   \
	status_t BMessage::Replace##Name(const char* name, int32 index, Type value)                    \
	{                                                                                              \
		return ReplaceData(name, code, index, &value, sizeof(value));                              \
	}                                                                                              \
                                                                                                   \
	status_t BMessage::Find##Name(const char* name, Type* value) const                             \
	{                                                                                              \
		return Find##Name(name, 0, value);                                                         \
	}                                                                                              \
                                                                                                   \
	status_t BMessage::Find##Name(const char* name, int32 index, Type* value) const                \
	{                                                                                              \
		const status_t status = FindValue(name, code, index, value, sizeof(*value));               \
		if (status != B_OK && value != nullptr)                                                    \
			*value = Type();                                                                       \
		return status;                                                                             \
	}                                                                                              \
                                                                                                   \
	bool BMessage::Has##Name(const char* name, int32 index) const                                  \
	{                                                                                              \
		return HasValue(name, code, index, sizeof(Type));                                          \
	}                                                                                              \
                                                                                                   \
	Type BMessage::Get##Name(const char* name, TypeRef defaultValue) const                         \
	{                                                                                              \
		return Get##Name(name, 0, defaultValue);                                                   \
	}                                                                                              \
                                                                                                   \
	Type BMessage::Get##Name(const char* name, int32 index, TypeRef defaultValue) const            \
	{                                                                                              \
		Type value = defaultValue;                                                                 \
		FindValue(name, code, index, &value, sizeof(value));                                       \
		return value;                                                                              \
	}                                                                                              \
                                                                                                   \
	status_t BMessage::Set##Name(const char* name, TypeRef value)                                  \
	{                                                                                              \
		return SetData(name, code, &value, sizeof(value), true);                                   \
	}
// NOLINTEND(bugprone-macro-parentheses)

#define DEFINE_FIND_BY_VALUE(Name, Type)                                                           \
	Type BMessage::Find##Name(const char* name, int32 index) const                                 \
	{                                                                                              \
		Type value;                                                                                \
		Find##Name(name, index, &value);                                                           \
		return value;                                                                              \
	}

DEFINE_VALUE(Bool, bool, bool, B_BOOL_TYPE)
DEFINE_VALUE(Int8, int8, int8, B_INT8_TYPE)
DEFINE_VALUE(UInt8, uint8, uint8, B_UINT8_TYPE)
DEFINE_VALUE(Int16, int16, int16, B_INT16_TYPE)
DEFINE_VALUE(UInt16, uint16, uint16, B_UINT16_TYPE)
DEFINE_VALUE(Int32, int32, int32, B_INT32_TYPE)
DEFINE_VALUE(UInt32, uint32, uint32, B_UINT32_TYPE)
DEFINE_VALUE(Int64, int64, int64, B_INT64_TYPE)
DEFINE_VALUE(UInt64, uint64, uint64, B_UINT64_TYPE)
DEFINE_VALUE(Float, float, float, B_FLOAT_TYPE)
DEFINE_VALUE(Double, double, double, B_DOUBLE_TYPE)
DEFINE_VALUE(Point, BPoint, const BPoint&, B_POINT_TYPE)
DEFINE_VALUE(Rect, BRect, const BRect&, B_RECT_TYPE)
DEFINE_VALUE(Size, BSize, const BSize&, B_SIZE_TYPE)
DEFINE_VALUE(Color, rgb_color, rgb_color, B_RGB_COLOR_TYPE)

DEFINE_FIND_BY_VALUE(Bool, bool)
DEFINE_FIND_BY_VALUE(Int8, int8)
DEFINE_FIND_BY_VALUE(Int16, int16)
DEFINE_FIND_BY_VALUE(Int32, int32)
DEFINE_FIND_BY_VALUE(Int64, int64)
DEFINE_FIND_BY_VALUE(Float, float)
DEFINE_FIND_BY_VALUE(Double, double)
DEFINE_FIND_BY_VALUE(Point, BPoint)
DEFINE_FIND_BY_VALUE(Rect, BRect)

#undef DEFINE_FIND_BY_VALUE
#undef DEFINE_VALUE


// #pragma mark - Pointers


status_t
BMessage::AddPointer(const char* name, const void* value)
{
	return AddData(name, B_POINTER_TYPE, &value, sizeof(value), true);
}


status_t
BMessage::ReplacePointer(const char* name, const void* value)
{
	return ReplacePointer(name, 0, value);
}


status_t
BMessage::ReplacePointer(const char* name, int32 index, const void* value)
{
	return ReplaceData(name, B_POINTER_TYPE, index, &value, sizeof(value));
}


status_t
BMessage::SetPointer(const char* name, const void* value)
{
	return SetData(name, B_POINTER_TYPE, &value, sizeof(value), true);
}


status_t
BMessage::FindPointer(const char* name, void** value) const
{
	return FindPointer(name, 0, value);
}


status_t
BMessage::FindPointer(const char* name, int32 index, void** value) const
{
	const status_t status = FindValue(name, B_POINTER_TYPE, index, value, sizeof(*value));
	if (status != B_OK && value != nullptr)
		*value = nullptr;
	return status;
}


bool
BMessage::HasPointer(const char* name, int32 index) const
{
	return HasValue(name, B_POINTER_TYPE, index, sizeof(void*));
}


const void*
BMessage::GetPointer(const char* name, const void* defaultValue) const
{
	return GetPointer(name, 0, defaultValue);
}


const void*
BMessage::GetPointer(const char* name, int32 index, const void* defaultValue) const
{
	const void* value = defaultValue;
	FindValue(name, B_POINTER_TYPE, index, &value, sizeof(value));
	return value;
}
