// SPDX-License-Identifier: MIT
// Pictures and styled text from files and resources.
#ifndef _TRANSLATION_UTILS_H
#define _TRANSLATION_UTILS_H

#include <SupportDefs.h>

class BBitmap;
class BPositionIO;
class BTextView;
class BTranslatorRoster;
struct entry_ref;

/// Reads what the display's picture readers know: PNG, JPEG, BMP, GIF, PPM, XPM.
///
/// A bitmap is new and the caller's, B_RGBA32; null when there is none, or on a display without pixels,
/// which reads no pictures. The roster is not asked.
class BTranslationUtils {
public:
	/// A file, else a resource 'bits' of this name in the program.
	static BBitmap* GetBitmap(const char* name, BTranslatorRoster* roster = NULL);
	static BBitmap* GetBitmap(uint32 type, int32 id, BTranslatorRoster* roster = NULL);
	static BBitmap* GetBitmap(uint32 type, const char* name, BTranslatorRoster* roster = NULL);
	static BBitmap* GetBitmapFile(const char* name, BTranslatorRoster* roster = NULL);
	static BBitmap* GetBitmap(const entry_ref* ref, BTranslatorRoster* roster = NULL);
	/// From the stream's present position to its end.
	static BBitmap* GetBitmap(BPositionIO* stream, BTranslatorRoster* roster = NULL);

	/// Inserts styled text ('STXT') or plain UTF-8 text at the view's caret; the styles count in a
	/// stylable view.
	/// Lock the view's window. Returns B_OK; B_BAD_VALUE for null; B_BAD_DATA or the stream's error,
	/// nothing inserted.
	static status_t GetStyledText(
		BPositionIO* fromStream, BTextView* intoView, BTranslatorRoster* roster = NULL);
	/// \a encoding: null or "UTF-8"; B_BAD_VALUE for another.
	static status_t GetStyledText(BPositionIO* fromStream, BTextView* intoView,
		const char* encoding, BTranslatorRoster* roster = NULL);
	/// Writes the view's text as styled text with its fonts and colours. Lock the view's window. Returns
	/// B_OK; B_BAD_VALUE for null; the stream's error.
	static status_t PutStyledText(
		BTextView* fromView, BPositionIO* intoStream, BTranslatorRoster* roster = NULL);
};

#endif // _TRANSLATION_UTILS_H
