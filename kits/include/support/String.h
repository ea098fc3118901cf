// SPDX-License-Identifier: MIT
// A text value that grows as needed.

#ifndef _BE_STRING_H
#define _BE_STRING_H

#include <string>

#include <SupportDefs.h>

/// A text, UTF-8. Copies are values of their own.
///
/// Lengths, offsets and positions are bytes. A null text counts as the empty one. Functions that
/// return a BString& change this object and return it. Functions with "I" ignore the case of ASCII
/// letters. Text arguments may point into the object itself.
class BString {
public:
	BString();
	BString(const char* string);
	BString(const BString& string);
	BString(BString&& string) noexcept;
	/// At most \a maxLength bytes, fewer when the text ends before.
	BString(const char* string, int32 maxLength);
	~BString();

	/// Never null; valid until the object changes.
	const char* String() const;
	int32 Length() const;
	/// UTF-8 characters.
	int32 CountChars() const;
	bool IsEmpty() const;

	BString& operator=(const BString& string);
	BString& operator=(BString&& string) noexcept;
	BString& operator=(const char* string);
	BString& operator=(char c);
	BString& SetTo(const char* string);
	BString& SetTo(const char* string, int32 maxLength);
	BString& SetTo(const BString& string);
	BString& SetTo(const BString& string, int32 maxLength);
	BString& SetTo(char c, int32 count);

	/// Sets \a into to the bytes [fromOffset, fromOffset + length), clipped to the text.
	BString& CopyInto(BString& into, int32 fromOffset, int32 length) const;
	/// As above, into a buffer of at least \a length bytes; writes no terminator.
	void CopyInto(char* into, int32 fromOffset, int32 length) const;

	BString& operator+=(const BString& string);
	BString& operator+=(const char* string);
	BString& operator+=(char c);
	BString& Append(const BString& string);
	BString& Append(const char* string);
	BString& Append(const BString& string, int32 length);
	BString& Append(const char* string, int32 length);
	BString& Append(char c, int32 count);

	BString& Prepend(const char* string);
	BString& Prepend(const BString& string);
	BString& Prepend(const char* string, int32 length);
	BString& Prepend(const BString& string, int32 length);
	BString& Prepend(char c, int32 count);

	/// A position beyond the length changes nothing; a negative one skips that many leading bytes
	/// of the inserted text and inserts the rest at 0.
	BString& Insert(const char* string, int32 position);
	BString& Insert(const char* string, int32 length, int32 position);
	BString& Insert(const char* string, int32 fromOffset, int32 length, int32 position);
	BString& Insert(const BString& string, int32 position);
	BString& Insert(const BString& string, int32 length, int32 position);
	BString& Insert(const BString& string, int32 fromOffset, int32 length, int32 position);
	BString& Insert(char c, int32 count, int32 position);

	BString& Truncate(int32 newLength, bool lazy = true);
	BString& Remove(int32 from, int32 length);
	BString& RemoveFirst(const BString& string);
	BString& RemoveLast(const BString& string);
	BString& RemoveAll(const BString& string);
	BString& RemoveFirst(const char* string);
	BString& RemoveLast(const char* string);
	BString& RemoveAll(const char* string);
	BString& RemoveSet(const char* setOfBytesToRemove);

	/// As CopyInto(), and removes the bytes from this object.
	BString& MoveInto(BString& into, int32 from, int32 length);
	void MoveInto(char* into, int32 from, int32 length);

	bool operator<(const BString& string) const;
	bool operator<=(const BString& string) const;
	bool operator==(const BString& string) const;
	bool operator>=(const BString& string) const;
	bool operator>(const BString& string) const;
	bool operator!=(const BString& string) const;
	bool operator<(const char* string) const;
	bool operator<=(const char* string) const;
	bool operator==(const char* string) const;
	bool operator>=(const char* string) const;
	bool operator>(const char* string) const;
	bool operator!=(const char* string) const;
	operator const char*() const;

	/// Negative, 0 or positive, by bytes; with a length only that many bytes count.
	int Compare(const BString& string) const;
	int Compare(const char* string) const;
	int Compare(const BString& string, int32 length) const;
	int Compare(const char* string, int32 length) const;
	int ICompare(const BString& string) const;
	int ICompare(const char* string) const;
	int ICompare(const BString& string, int32 length) const;
	int ICompare(const char* string, int32 length) const;

	/// The offset of an occurrence; B_ERROR when there is none, B_BAD_VALUE for a null text.
	///
	/// With \a fromOffset the first that starts there or later, with \a beforeOffset the last that
	/// ends there or earlier.
	int32 FindFirst(const BString& string) const;
	int32 FindFirst(const char* string) const;
	int32 FindFirst(const BString& string, int32 fromOffset) const;
	int32 FindFirst(const char* string, int32 fromOffset) const;
	int32 FindFirst(char c) const;
	int32 FindFirst(char c, int32 fromOffset) const;
	int32 FindLast(const BString& string) const;
	int32 FindLast(const char* string) const;
	int32 FindLast(const BString& string, int32 beforeOffset) const;
	int32 FindLast(const char* string, int32 beforeOffset) const;
	int32 FindLast(char c) const;
	int32 FindLast(char c, int32 beforeOffset) const;
	int32 IFindFirst(const BString& string) const;
	int32 IFindFirst(const char* string) const;
	int32 IFindFirst(const BString& string, int32 fromOffset) const;
	int32 IFindFirst(const char* string, int32 fromOffset) const;
	int32 IFindLast(const BString& string) const;
	int32 IFindLast(const char* string) const;
	int32 IFindLast(const BString& string, int32 beforeOffset) const;
	int32 IFindLast(const char* string, int32 beforeOffset) const;

	/// One pass from left to right: replaced text is not searched again.
	BString& ReplaceFirst(char replaceThis, char withThis);
	BString& ReplaceLast(char replaceThis, char withThis);
	BString& ReplaceAll(char replaceThis, char withThis, int32 fromOffset = 0);
	BString& ReplaceFirst(const char* replaceThis, const char* withThis);
	BString& ReplaceLast(const char* replaceThis, const char* withThis);
	BString& ReplaceAll(const char* replaceThis, const char* withThis, int32 fromOffset = 0);
	BString& IReplaceFirst(char replaceThis, char withThis);
	BString& IReplaceAll(char replaceThis, char withThis, int32 fromOffset = 0);
	BString& IReplaceFirst(const char* replaceThis, const char* withThis);
	BString& IReplaceAll(const char* replaceThis, const char* withThis, int32 fromOffset = 0);
	BString& ReplaceSet(const char* setOfBytes, char with);
	BString& ReplaceSet(const char* setOfBytes, const char* with);

	/// Not checked; the terminator at Length().
	char operator[](int32 index) const;
	/// 0 outside the text.
	char ByteAt(int32 index) const;
	BString& SetByteAt(int32 pos, char to);

	/// A writable buffer of at least \a maxLength + 1 bytes that holds the text. No other function
	/// but UnlockBuffer() may be called until then.
	char* LockBuffer(int32 maxLength);
	/// \a length: what is kept of the buffer; -1: up to its first null byte.
	BString& UnlockBuffer(int32 length = -1);

	BString& ToLower();
	BString& ToUpper();
	/// The first letter as a capital, all others small.
	BString& Capitalize();
	BString& CapitalizeEachWord();
	/// Removes white space at both ends.
	BString& Trim();

	/// Appends: bool as "true" or "false", float and double with two decimals.
	BString& operator<<(const char* string);
	BString& operator<<(const BString& string);
	BString& operator<<(char c);
	BString& operator<<(bool value);
	BString& operator<<(int value);
	BString& operator<<(unsigned int value);
	BString& operator<<(unsigned long value);
	BString& operator<<(long value);
	BString& operator<<(unsigned long long value);
	BString& operator<<(long long value);
	BString& operator<<(float value);
	BString& operator<<(double value);

private:
	std::string fText;
};


bool operator<(const char* a, const BString& b);
bool operator<=(const char* a, const BString& b);
bool operator==(const char* a, const BString& b);
bool operator>(const char* a, const BString& b);
bool operator>=(const char* a, const BString& b);
bool operator!=(const char* a, const BString& b);

#endif // _BE_STRING_H
