// SPDX-License-Identifier: MIT
// Conversion between UTF-8 and other encodings.

#ifndef _UTF_8_H
#define _UTF_8_H

#include <SupportDefs.h>

enum {
	B_ISO1_CONVERSION,
	B_ISO2_CONVERSION,
	B_ISO3_CONVERSION,
	B_ISO4_CONVERSION,
	B_ISO5_CONVERSION,
	B_ISO6_CONVERSION,
	B_ISO7_CONVERSION,
	B_ISO8_CONVERSION,
	B_ISO9_CONVERSION,
	B_ISO10_CONVERSION,
	B_MAC_ROMAN_CONVERSION,
	B_SJIS_CONVERSION,
	B_EUC_CONVERSION,
	B_JIS_CONVERSION,
	B_MS_WINDOWS_CONVERSION,
	B_UNICODE_CONVERSION,
	B_KOI8R_CONVERSION,
	B_MS_WINDOWS_1251_CONVERSION,
	B_MS_DOS_866_CONVERSION,
	B_MS_DOS_CONVERSION,
	B_EUC_KR_CONVERSION,
	B_ISO13_CONVERSION,
	B_ISO14_CONVERSION,
	B_ISO15_CONVERSION,
	B_BIG5_CONVERSION,
	B_GBK_CONVERSION,
	B_UTF16_CONVERSION,
	B_MS_WINDOWS_1250_CONVERSION,
};

/// Converts as much of \a source as fits into \a dest.
///
/// \a sourceLength, \a destLength: bytes there are, then bytes used. \a state is not used: a piece of
/// JIS text has to begin in ASCII. Bytes that are no character give \a substitute, or are left
/// out when it is 0; a character that is cut off at the end of \a source is left for the next call.
/// Returns B_OK; B_BAD_VALUE for null pointers, negative lengths or an unknown encoding; B_ERROR
/// when nothing at all could be converted though there was text.
status_t convert_to_utf8(uint32 sourceEncoding, const char* source, int32* sourceLength, char* dest,
	int32* destLength, int32* state, char substitute = 0x1a);
status_t convert_from_utf8(uint32 destEncoding, const char* source, int32* sourceLength, char* dest,
	int32* destLength, int32* state, char substitute = 0x1a);

#endif // _UTF_8_H
