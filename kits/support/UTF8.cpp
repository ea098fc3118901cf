// SPDX-License-Identifier: MIT
// Conversion between UTF-8 and other encodings, by the host's tables.

#include <UTF8.h>

#include <errno.h>
#include <iconv.h>

#include <algorithm>

namespace {

// By the numbers of the encodings.
constexpr const char* kEncodings[] = {"ISO-8859-1", "ISO-8859-2", "ISO-8859-3", "ISO-8859-4",
	"ISO-8859-5", "ISO-8859-6", "ISO-8859-7", "ISO-8859-8", "ISO-8859-9", "ISO-8859-10",
	"MACINTOSH", "SHIFT_JIS", "EUC-JP", "ISO-2022-JP", "CP1252", "UTF-16BE", "KOI8-R", "CP1251",
	"CP866", "CP437", "EUC-KR", "ISO-8859-13", "ISO-8859-14", "ISO-8859-15", "BIG5", "GBK",
	"UTF-16BE", "CP1250"};


/// One call's conversion: what is left of the source, and the room left.
class Conversion {
public:
	Conversion(const char* to, const char* from, const char* source, size_t sourceLength,
		char* dest, size_t destLength)
		: fConverter(iconv_open(to, from)),
		  fSource(const_cast<char*>(source)),
		  fSourceLeft(sourceLength),
		  fDest(dest),
		  fDestLeft(destLength)
	{
	}
	~Conversion()
	{
		if (IsValid())
			iconv_close(fConverter);
	}

	bool IsValid() const { return fConverter != reinterpret_cast<iconv_t>(-1); }
	size_t SourceLeft() const { return fSourceLeft; }
	size_t DestLeft() const { return fDestLeft; }

	/// \a isUtf8: whether the source is. \a substitute: 0 leaves out what cannot be converted.
	void Run(bool isUtf8, char substitute);

private:
	bool WriteSubstitute(bool isUtf8, char substitute);
	size_t BadLength(bool isUtf8) const;

	iconv_t fConverter;
	char* fSource;
	size_t fSourceLeft;
	char* fDest;
	size_t fDestLeft;
};


void
Conversion::Run(bool isUtf8, char substitute)
{
	while (fSourceLeft > 0) {
		if (iconv(fConverter, &fSource, &fSourceLeft, &fDest, &fDestLeft)
			!= static_cast<size_t>(-1))
			break;
		// A full buffer, or a character cut off at the end.
		if (errno != EILSEQ || !WriteSubstitute(isUtf8, substitute))
			break;
		size_t skipped = BadLength(isUtf8);
		fSource += skipped;
		fSourceLeft -= skipped;
	}
	// Encodings with states end in their first one.
	iconv(fConverter, nullptr, nullptr, &fDest, &fDestLeft);
}


/// False when there is no room for it.
bool
Conversion::WriteSubstitute(bool isUtf8, char substitute)
{
	if (substitute == '\0')
		return true;
	if (isUtf8) {
		// The encoding has its own way to write it, if any.
		char* text = &substitute;
		size_t left = 1;
		return iconv(fConverter, &text, &left, &fDest, &fDestLeft) != static_cast<size_t>(-1)
			|| errno != E2BIG;
	}
	if (fDestLeft == 0)
		return false;
	*fDest++ = substitute;
	fDestLeft--;
	return true;
}


/// The bytes of the character that could not be converted.
size_t
Conversion::BadLength(bool isUtf8) const
{
	size_t length = 1;
	if (isUtf8) {
		auto isContinuation = [this](size_t at) {
			return (static_cast<uchar>(fSource[at]) & 0xc0) == 0x80;
		};
		while (length < 4 && length < fSourceLeft && isContinuation(length))
			length++;
	}
	return std::min(length, fSourceLeft);
}


status_t
convert(bool fromUtf8, uint32 encoding, const char* source, int32* sourceLength, char* dest,
	int32* destLength, char substitute)
{
	if (encoding >= B_COUNT_OF(kEncodings) || source == nullptr || sourceLength == nullptr
		|| dest == nullptr || destLength == nullptr || *sourceLength < 0 || *destLength < 0)
		return B_BAD_VALUE;

	const char* from = fromUtf8 ? "UTF-8" : kEncodings[encoding];
	const char* to = fromUtf8 ? kEncodings[encoding] : "UTF-8";
	Conversion conversion(to, from, source, *sourceLength, dest, *destLength);
	if (!conversion.IsValid())
		return B_BAD_VALUE;
	conversion.Run(fromUtf8, substitute);

	int32 given = *sourceLength;
	*sourceLength -= static_cast<int32>(conversion.SourceLeft());
	*destLength -= static_cast<int32>(conversion.DestLeft());
	return given > 0 && *sourceLength == 0 ? B_ERROR : B_OK;
}

} // namespace


status_t
convert_to_utf8(uint32 sourceEncoding, const char* source, int32* sourceLength, char* dest,
	int32* destLength, int32*, char substitute)
{
	return convert(false, sourceEncoding, source, sourceLength, dest, destLength, substitute);
}


status_t
convert_from_utf8(uint32 destEncoding, const char* source, int32* sourceLength, char* dest,
	int32* destLength, int32*, char substitute)
{
	return convert(true, destEncoding, source, sourceLength, dest, destLength, substitute);
}
