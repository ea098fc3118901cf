// SPDX-License-Identifier: MIT
// A width and a height, in the sense of BRect: one less than the pixels covered.
#ifndef _SIZE_H
#define _SIZE_H

#include <SupportDefs.h>

#define B_SIZE_UNSET (-2)
#define B_SIZE_UNLIMITED (1024 * 1024 * 1024)

class BSize {
public:
	float width;
	float height;

	/// Unset in both directions.
	BSize()
		: width(B_SIZE_UNSET),
		  height(B_SIZE_UNSET)
	{
	}
	BSize(const BSize& other) = default;
	BSize(float width, float height)
		: width(width),
		  height(height)
	{
	}
	BSize& operator=(const BSize& other) = default;

	float Width() const { return width; }
	float Height() const { return height; }

	void Set(float width, float height)
	{
		this->width = width;
		this->height = height;
	}

	void SetWidth(float width) { this->width = width; }
	void SetHeight(float height) { this->height = height; }

	bool operator==(const BSize& other) const
	{
		return width == other.width && height == other.height;
	}
	bool operator!=(const BSize& other) const { return !(*this == other); }
};

#endif // _SIZE_H
