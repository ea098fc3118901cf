// SPDX-License-Identifier: MIT
// The storage of the texts of a property.

#pragma once

#include <SupportDefs.h>

/// A text of at most 1024 bytes that a property holds.
///
/// The limits are those of a buffer of 1024 bytes, but the memory is that of the text: short texts
/// lie inside the object, longer ones on the heap. A form of a thousand components has some twenty
/// thousand properties of four texts each, which whole buffers would blow up to 80 megabytes.
///
/// Any text may be assigned, a part of the object's own too. Not for use by two threads at once.
class TPropertyText {
public:
	/// The size of the buffer that the text stands for, in bytes, with the terminator.
	static const size_t kSize = 1024;

	TPropertyText()
		: fText(fShort),
		  fShort()
	{
	}
	~TPropertyText();
	TPropertyText(const TPropertyText&) = delete;
	TPropertyText& operator=(const TPropertyText&) = delete;

	/// The text; never null, always terminated, valid until the next assignment.
	const char* Text() const { return fText; }

	/// Takes over at most 1023 bytes of \a text. A null text is ignored.
	void SetTo(const char* text);

	/// Takes over at most 1024 bytes of \a text: one of 1024 bytes or more fills the buffer without
	/// a terminator inside it. (One follows behind the buffer, so Text() stays safe to read.)
	void Fill(const char* text);

private:
	void Assign(const char* text, size_t length);

	static const size_t kShortSize = 24;

	char* fText;
	union {
		char fShort[kShortSize];
		size_t fCapacity; // of the text on the heap
	};
};


/// The same for a text that few properties have: nothing but a pointer until it is set.
class TRarePropertyText {
public:
	TRarePropertyText()
		: fText(nullptr)
	{
	}
	~TRarePropertyText();
	TRarePropertyText(const TRarePropertyText&) = delete;
	TRarePropertyText& operator=(const TRarePropertyText&) = delete;

	bool IsSet() const { return fText != nullptr; }

	/// Null until it is set; valid until the next assignment.
	const char* Text() const { return fText; }

	/// Takes over at most 1023 bytes of \a text. A null text is ignored.
	void SetTo(const char* text)
	{
		if (text != nullptr)
			Assign(text);
	}

private:
	void Assign(const char* text);

	char* fText;
};
