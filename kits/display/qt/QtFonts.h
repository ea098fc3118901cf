// SPDX-License-Identifier: MIT
// The host's fonts, by Qt's font database.
#ifndef DISPLAY_QT_FONTS_H
#define DISPLAY_QT_FONTS_H

#include <mutex>
#include <string>
#include <vector>

#include "display/FontEngine.h"
#include "display/qt/TextRuns.h"

class QFont;
class QPointF;
class QString;

namespace BPrivate {

/// Sizes are pixels of the API. Text is neither hinted nor kerned, so that widths grow with the size and
/// are the sum of the characters' escapements.
class QtFonts : public FontEngine {
public:
	QtFonts();

	int32 CountFamilies() override;
	status_t GetFamily(int32 index, font_family* name) override;
	int32 CountStyles(int32 family) override;
	status_t GetStyle(int32 family, int32 style, FontStyleInfo* info) override;
	void GetStandardFont(standard_font which, uint16* family, uint16* style, float* size) override;

	font_height Height(const FontKey& font) override;
	float StringWidth(const FontKey& font, const char* text, int32 length) override;
	void GetEscapements(
		const FontKey& font, const char* text, int32 count, float* escapements) override;
	void GetGlyphBounds(const FontKey& font, const char* text, int32 count, BRect* bounds) override;

	/// What is known of short texts.
	TextRuns& Runs() { return fRuns; }

	/// Draws the text for a baseline that starts at \a rest within a pixel, and keeps it. Null when it is too large.
	std::shared_ptr<const TextRun> MakeRun(
		const FontKey& font, const char* text, int32 length, float scale, const QPointF& rest);

	/// The font for drawing at \a scale device pixels for each of the API's.
	QFont FontFor(const FontKey& font, float scale);

private:
	struct Style {
		std::string name;
		uint16 face;
		int weight;
		bool isItalic;
		bool isFixed;
	};

	struct Family {
		std::string name;
		bool hasStyles;
		std::vector<Style> styles;
	};

	QFont MakeFont(const FontKey& font, float scale);
	Family* FamilyAt(int32 index);
	void ReadFamilies();
	void FindStandardFont(standard_font which);

	// The lists are read when they are first asked for: the host may have a great many fonts.
	TextRuns fRuns;
	std::mutex fMutex;
	bool fHasFamilies;
	std::vector<Family> fFamilies;
	bool fHasStandard[3];
	uint16 fStandardFamilies[3];
	uint16 fStandardStyles[3];
};

} // namespace BPrivate

#endif // DISPLAY_QT_FONTS_H
