// SPDX-License-Identifier: MIT
// Objects that can be written as a run of bytes.

#ifndef _FLATTENABLE_H
#define _FLATTENABLE_H

#include <SupportDefs.h>
#include <TypeConstants.h>

/// An object that can be written to, and set from, a flat buffer.
class BFlattenable {
public:
	virtual ~BFlattenable();

	virtual bool IsFixedSize() const = 0;
	virtual type_code TypeCode() const = 0;
	virtual ssize_t FlattenedSize() const = 0;
	/// B_BAD_VALUE when \a size is less than FlattenedSize().
	virtual status_t Flatten(void* buffer, ssize_t size) const = 0;
	/// Whether Unflatten() takes data of type \a code. Here: only TypeCode().
	virtual bool AllowsTypeCode(type_code code) const;
	virtual status_t Unflatten(type_code code, const void* buffer, ssize_t size) = 0;
};

#endif // _FLATTENABLE_H
