// SPDX-License-Identifier: MIT
// The host's fonts, by Qt's font database.
#include "display/qt/QtFonts.h"

#include <algorithm>
#include <cmath>
#include <cstring>
#include <memory>
#include <mutex>
#include <vector>

#include <QFont>
#include <QFontDatabase>
#include <QFontInfo>
#include <QFontMetricsF>
#include <QPainter>
#include <QString>
#include <QStringList>

#include "display/FontSettings.h"
#include "display/Utf8.h"
#include "display/qt/Mask.h"
#include "display/qt/QtUse.h"

namespace BPrivate {

namespace {

// Qt counts in points of 96 to 72 pixels (the application object is told so).
const double kPointsPerPixel = 0.75;
// Pixels of a text that is kept.
const double kLargestRun = 65536;


/// The font and metrics that a thread used last: most text comes in runs of one font.
struct LastFont {
	FontKey key;
	QFontMetricsF metrics;
	font_height height;
};


uint16
FaceOf(const QString& family, const QString& style)
{
	int weight = QFontDatabase::weight(family, style);
	auto isCalled = [&](const char* word) {
		return style.contains(QLatin1String(word), Qt::CaseInsensitive);
	};
	uint16 face = 0;
	if (QFontDatabase::italic(family, style) || isCalled("Italic") || isCalled("Oblique"))
		face |= B_ITALIC_FACE;
	if (weight >= QFont::Black)
		face |= B_HEAVY_FACE;
	else if (weight >= QFont::DemiBold)
		face |= B_BOLD_FACE;
	else if (weight <= QFont::Light)
		face |= B_LIGHT_FACE;
	if (isCalled("Condensed"))
		face |= B_CONDENSED_FACE;
	return face == 0 ? static_cast<uint16>(B_REGULAR_FACE) : face;
}


/// Where a style comes in its family's list.
int
RankOf(uint16 face)
{
	int rank = 0;
	for (uint16 one : {B_BOLD_FACE, B_ITALIC_FACE, B_LIGHT_FACE, B_HEAVY_FACE, B_CONDENSED_FACE}) {
		rank = rank >> 1;
		rank += (face & one) != 0 ? 16 : 0;
	}
	return rank;
}


QString
StandardFamily(standard_font which)
{
	QFont font(which == kFixedFont ? QLatin1String("monospace") : QLatin1String("sans-serif"));
	if (which == kFixedFont) {
		font.setStyleHint(QFont::Monospace);
		font.setFixedPitch(true);
	} else
		font.setStyleHint(QFont::SansSerif);
	return QFontInfo(font).family();
}


bool
SameKey(const FontKey& a, const FontKey& b)
{
	return a.family == b.family && a.style == b.style && a.size == b.size && a.face == b.face
		&& a.shear == b.shear && a.spacing == b.spacing && a.flags == b.flags;
}


/// The smallest rect around what is covered.
QRect
InkOf(const Mask& mask)
{
	const QRect area = mask.Area();
	QRect ink;
	for (int y = area.top(); y <= area.bottom(); y++) {
		const uint8* row = mask.Row(area.left(), y);
		const uint8* end = row + area.width();
		const uint8* first = std::find_if(row, end, [](uint8 coverage) { return coverage != 0; });
		if (first == end)
			continue;
		const uint8* last = end - 1;
		while (*last == 0)
			last--;
		ink |= QRect(QPoint(area.left() + static_cast<int>(first - row), y),
			QPoint(area.left() + static_cast<int>(last - row), y));
	}
	return ink;
}


/// Keeps what threads leave that end when Qt is gone already: it is Qt's own, so it is never destroyed.
template <typename Content>
void
LeaveBehind(std::unique_ptr<Content> content)
{
	static std::mutex& sMutex = *new std::mutex;
	static auto& sLeft = *new std::vector<std::unique_ptr<Content>>;
	std::lock_guard<std::mutex> lock(sMutex);
	sLeft.push_back(std::move(content));
}


/// What a thread keeps of its last font.
template <typename Content>
class ThreadsLast {
public:
	~ThreadsLast()
	{
		const QtUse use;
		if (!use && content != nullptr)
			LeaveBehind(std::move(content));
	}

	std::unique_ptr<Content> content;
};


/// Within a QtUse.
const LastFont&
Last(QtFonts& fonts, const FontKey& key)
{
	thread_local ThreadsLast<LastFont> last;
	if (last.content == nullptr || !SameKey(last.content->key, key)) {
		const QFontMetricsF metrics(fonts.FontFor(key, 1));
		last.content = std::make_unique<LastFont>(LastFont{key, metrics,
			{static_cast<float>(metrics.ascent()), static_cast<float>(metrics.descent()),
				static_cast<float>(std::max(metrics.leading(), 0.0))}});
	}
	return *last.content;
}

} // namespace


QtFonts::QtFonts()
	: fHasFamilies(false),
	  fHasStandard(),
	  fStandardFamilies(),
	  fStandardStyles()
{
}


void
QtFonts::ReadFamilies()
{
	if (fHasFamilies)
		return;
	fHasFamilies = true;
	AwaitFontSettings();
	for (const QString& name : QFontDatabase::families()) {
		std::string utf8 = name.toStdString();
		if (utf8.size() <= B_FONT_FAMILY_LENGTH && !QFontDatabase::isPrivateFamily(name))
			fFamilies.push_back({utf8, false, {}});
	}
}


void
QtFonts::FindStandardFont(standard_font which)
{
	if (fHasStandard[which])
		return;
	fHasStandard[which] = true;
	ReadFamilies();
	auto find = [this](const std::string& name) {
		return std::find_if(fFamilies.begin(), fFamilies.end(),
			[&](const Family& family) { return family.name == name; });
	};
	// Qt would load a font to tell its family.
	auto found = which == kFixedFont ? fFamilies.end() : find(AwaitFontSettings());
	if (found == fFamilies.end())
		found = find(StandardFamily(which).toStdString());
	if (found == fFamilies.end())
		return;

	int32 index = static_cast<int32>(found - fFamilies.begin());
	fStandardFamilies[which] = static_cast<uint16>(index);
	uint16 wanted = which == kBoldFont ? B_BOLD_FACE : B_REGULAR_FACE;
	Family* family = FamilyAt(index);
	for (size_t i = 0; i < family->styles.size(); i++) {
		if (family->styles[i].face == wanted) {
			fStandardStyles[which] = static_cast<uint16>(i);
			break;
		}
	}
}


QtFonts::Family*
QtFonts::FamilyAt(int32 index)
{
	ReadFamilies();
	if (index < 0 || index >= static_cast<int32>(fFamilies.size()))
		return nullptr;

	Family& family = fFamilies[index];
	if (family.hasStyles)
		return &family;
	family.hasStyles = true;
	QString familyName = QString::fromStdString(family.name);
	for (const QString& style : QFontDatabase::styles(familyName)) {
		std::string name = style.toStdString();
		if (name.size() > B_FONT_STYLE_LENGTH)
			continue;
		family.styles.push_back(
			{name, FaceOf(familyName, style), QFontDatabase::weight(familyName, style),
				(FaceOf(familyName, style) & B_ITALIC_FACE) != 0,
				QFontDatabase::isFixedPitch(familyName, style)});
	}
	// The upright regular style first: it is what a family without a style stands for.
	std::stable_sort(family.styles.begin(), family.styles.end(),
		[](const Style& a, const Style& b) { return RankOf(a.face) < RankOf(b.face); });
	return &family;
}


int32
QtFonts::CountFamilies()
{
	const QtUse use;
	if (!use)
		return 0;
	std::lock_guard<std::mutex> lock(fMutex);
	ReadFamilies();
	return static_cast<int32>(fFamilies.size());
}


status_t
QtFonts::GetFamily(int32 index, font_family* name)
{
	const QtUse use;
	if (!use)
		return B_ERROR;
	std::lock_guard<std::mutex> lock(fMutex);
	ReadFamilies();
	if (index < 0 || index >= static_cast<int32>(fFamilies.size()))
		return B_BAD_INDEX;
	strcpy(*name, fFamilies[index].name.c_str());
	return B_OK;
}


int32
QtFonts::CountStyles(int32 index)
{
	const QtUse use;
	if (!use)
		return 0;
	std::lock_guard<std::mutex> lock(fMutex);
	const Family* family = FamilyAt(index);
	return family != nullptr ? static_cast<int32>(family->styles.size()) : 0;
}


status_t
QtFonts::GetStyle(int32 index, int32 style, FontStyleInfo* info)
{
	const QtUse use;
	if (!use)
		return B_ERROR;
	std::lock_guard<std::mutex> lock(fMutex);
	const Family* family = FamilyAt(index);
	if (family == nullptr || style < 0 || style >= static_cast<int32>(family->styles.size()))
		return B_BAD_INDEX;
	strcpy(info->name, family->styles[style].name.c_str());
	info->face = family->styles[style].face;
	info->isFixed = family->styles[style].isFixed;
	return B_OK;
}


void
QtFonts::GetStandardFont(standard_font which, uint16* family, uint16* style, float* size)
{
	const QtUse use;
	std::lock_guard<std::mutex> lock(fMutex);
	if (use)
		FindStandardFont(which);
	*family = fStandardFamilies[which];
	*style = fStandardStyles[which];
	*size = 12;
}


QFont
QtFonts::FontFor(const FontKey& key, float scale)
{
	// The one that the thread asked for last: Qt has found what belongs to it already.
	struct Known {
		FontKey key;
		float scale;
		QFont font;
	};
	thread_local ThreadsLast<Known> last;
	if (last.content == nullptr || last.content->scale != scale || !SameKey(last.content->key, key))
		last.content = std::make_unique<Known>(Known{key, scale, MakeFont(key, scale)});
	return last.content->font;
}


QFont
QtFonts::MakeFont(const FontKey& key, float scale)
{
	QFont font;
	{
		std::lock_guard<std::mutex> lock(fMutex);
		const Family* family = FamilyAt(key.family);
		if (family == nullptr) {
			FindStandardFont(kPlainFont);
			family = FamilyAt(fStandardFamilies[kPlainFont]);
		}
		if (family != nullptr) {
			font.setFamily(QString::fromStdString(family->name));
			if (key.style < family->styles.size()) {
				const Style& style = family->styles[key.style];
				font.setStyleName(QString::fromStdString(style.name));
				font.setWeight(static_cast<QFont::Weight>(style.weight));
				font.setItalic(style.isItalic);
			}
		}
	}
	double size = std::clamp(key.size, 0.5f, 10000.0f) * scale;
	font.setPointSizeF(size * kPointsPerPixel);
	font.setHintingPreference(QFont::PreferNoHinting);
	font.setKerning(false);
	font.setUnderline((key.face & B_UNDERSCORE_FACE) != 0);
	font.setStrikeOut((key.face & B_STRIKEOUT_FACE) != 0);
	if ((key.flags & B_DISABLE_ANTIALIASING) != 0)
		font.setStyleStrategy(QFont::NoAntialias);
	return font;
}


// #pragma mark - measuring


font_height
QtFonts::Height(const FontKey& font)
{
	const QtUse use;
	return use ? Last(*this, font).height : font_height{font.size, 0, 0};
}


float
QtFonts::StringWidth(const FontKey& font, const char* text, int32 length)
{
	if (length <= 0)
		return 0;
	const bool isKept = TextRuns::IsKept(length);
	if (isKept) {
		const std::shared_ptr<const TextRun> known = fRuns.Find(font, text, length);
		if (known != nullptr)
			return known->width;
	}
	const QtUse use;
	if (!use)
		return 0;
	const QFontMetricsF& metrics = Last(*this, font).metrics;
	const float width =
		static_cast<float>(metrics.horizontalAdvance(QString::fromUtf8(text, length)));
	if (isKept) {
		auto run = std::make_shared<TextRun>();
		run->width = width;
		fRuns.Keep(font, text, length, run);
	}
	return width;
}


std::shared_ptr<const TextRun>
QtFonts::MakeRun(
	const FontKey& font, const char* text, int32 length, float scale, const QPointF& rest)
{
	const QtUse use;
	if (!use)
		return nullptr;
	auto run = std::make_shared<TextRun>();
	run->width = StringWidth(font, text, length);
	run->scale = scale;
	run->x = rest.x();
	run->y = rest.y();

	const font_height height = Height(font);
	const double margin = font.size + 2;
	const QRectF box(rest.x() - margin * scale, rest.y() - (height.ascent + margin) * scale,
		(run->width + 2 * margin) * scale, (height.ascent + height.descent + 2 * margin) * scale);
	if (box.width() * box.height() > kLargestRun)
		return nullptr;
	Mask mask(box.toAlignedRect());
	if (mask.IsEmpty())
		return nullptr;
	QPainter painter(&mask.Image());
	painter.setRenderHint(QPainter::TextAntialiasing, (font.flags & B_DISABLE_ANTIALIASING) == 0);
	painter.translate(rest - mask.Area().topLeft());
	painter.setPen(Qt::white);
	painter.setFont(FontFor(font, scale));
	painter.drawText(QPointF(0, 0), QString::fromUtf8(text, length));
	painter.end();

	run->area = InkOf(mask);
	for (int y = run->area.top(); y <= run->area.bottom(); y++) {
		const uint8* row = mask.Row(run->area.left(), y);
		run->coverage.insert(run->coverage.end(), row, row + run->area.width());
	}
	run->coverage.shrink_to_fit();
	fRuns.Keep(font, text, length, run);
	return run;
}


void
QtFonts::GetEscapements(const FontKey& font, const char* text, int32 count, float* escapements)
{
	std::fill(escapements, escapements + count, 0);
	const QtUse use;
	if (!use)
		return;
	const QFontMetricsF& metrics = Last(*this, font).metrics;
	const char* end = text + strlen(text);
	for (int32 i = 0; i < count; i++) {
		if (text >= end)
			continue;
		char32_t character = NextCharacter(&text, end);
		escapements[i] =
			static_cast<float>(metrics.horizontalAdvance(QString::fromUcs4(&character, 1)));
	}
}


void
QtFonts::GetGlyphBounds(const FontKey& font, const char* text, int32 count, BRect* bounds)
{
	std::fill(bounds, bounds + count, BRect());
	const QtUse use;
	if (!use)
		return;
	const QFontMetricsF& metrics = Last(*this, font).metrics;
	const char* end = text + strlen(text);
	for (int32 i = 0; i < count; i++) {
		if (text >= end)
			continue;
		char32_t character = NextCharacter(&text, end);
		QRectF ink = metrics.tightBoundingRect(QString::fromUcs4(&character, 1));
		if (!ink.isEmpty())
			bounds[i].Set(ink.left(), ink.top(), ink.right() - 1, ink.bottom() - 1);
	}
}

} // namespace BPrivate
