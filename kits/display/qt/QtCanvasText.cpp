// SPDX-License-Identifier: MIT
// Text on the canvas.
#include <algorithm>
#include <cmath>
#include <cstring>

#include <QFont>
#include <QFontMetricsF>
#include <QPainter>
#include <QString>
#include <QTransform>

#include "display/Utf8.h"
#include "display/qt/Mask.h"
#include "display/qt/QtCanvas.h"
#include "display/qt/QtFonts.h"
#include "display/qt/QtUse.h"

namespace BPrivate {

namespace {

// Far outside of any buffer.
const double kFarthestText = 1 << 24;


bool
IsSpace(uint32 character)
{
	return character == ' ' || character == '\t' || character == '\n' || character == 0xa0;
}

} // namespace


/// Slant and rotation around the left end of the baseline.
static QTransform
TransformFor(const BFont& font)
{
	QTransform transform;
	transform.rotate(-font.Rotation());
	if (font.Shear() != 90)
		transform.shear(std::tan((font.Shear() - 90) * 3.14159265358979 / 180), 0);
	return transform;
}


BPoint
QtCanvas::DrawString(const char* text, int32 length, BPoint where, const escapement_delta* delta)
{
	if (length <= 0)
		return where;

	FontKey key = FontKey::Of(fState.font);
	float width = 0;
	if (delta == nullptr || (delta->space == 0 && delta->nonspace == 0)) {
		width = fFonts.StringWidth(key, text, length);
		DrawRun(text, length, where, width);
	} else {
		// Extra room: each character by itself.
		const char* end = text + length;
		QTransform transform = TransformFor(fState.font);
		while (text < end) {
			const char* start = text;
			uint32 character = NextCharacter(&text, end);
			float advance = fFonts.StringWidth(key, start, static_cast<int32>(text - start));
			QPointF offset = transform.map(QPointF(width, 0));
			BPoint place = where + BPoint(offset.x(), offset.y());
			DrawRun(start, static_cast<int32>(text - start), place, advance);
			width += advance + (IsSpace(character) ? delta->space : delta->nonspace);
		}
	}
	float angle = fState.font.Rotation() * 3.14159265f / 180;
	return where + BPoint(width * std::cos(angle), -width * std::sin(angle));
}


void
QtCanvas::DrawString(const char* text, int32 length, const BPoint* locations, int32 count)
{
	const char* end = text + std::max(length, 0);
	FontKey key = FontKey::Of(fState.font);
	for (int32 i = 0; i < count && text < end; i++) {
		const char* start = text;
		NextCharacter(&text, end);
		if (i == count - 1)
			text = end;
		int32 bytes = static_cast<int32>(text - start);
		DrawRun(start, bytes, locations[i], fFonts.StringWidth(key, start, bytes));
	}
}


void
QtCanvas::DrawRun(const char* text, int32 length, BPoint where, float width)
{
	fSparseLines.clear();
	if (DrawKnownRun(text, length, where))
		return;
	const QtUse use;
	if (!use)
		return;
	// What is far outside needs no characters.
	FontKey key = FontKey::Of(fState.font);
	font_height height = fFonts.Height(key);
	QTransform transform = TransformFor(fState.font);
	float margin = fState.font.Size() + 1;
	QRectF box(-margin, -height.ascent - margin, width + 2 * margin,
		height.ascent + height.descent + 2 * margin);
	// The baseline is the upper side of the row that it names: a capital ends in the row above.
	QPointF base(where.x + fState.origin.x, where.y + fState.origin.y);
	QRectF area = transform.mapRect(box).translated(base);
	Mask mask(DeviceBounds(area, fScale));
	if (mask.IsEmpty())
		return;

	QPainter painter(&mask.Image());
	painter.setRenderHint(
		QPainter::TextAntialiasing, (fState.font.Flags() & B_DISABLE_ANTIALIASING) == 0);
	painter.translate(
		base.x() * fScale - mask.Area().left(), base.y() * fScale - mask.Area().top());
	if (!transform.isIdentity())
		painter.setTransform(transform, true);
	painter.setPen(Qt::white);
	painter.setFont(fFonts.FontFor(key, fScale));
	painter.drawText(QPointF(0, 0), QString::fromUtf8(text, length));
	painter.end();
	PaintTextMask(mask);
}


/// Draws a short upright text by what is kept of it. False when nothing is kept of such a text.
bool
QtCanvas::DrawKnownRun(const char* text, int32 length, BPoint where)
{
	if (!TextRuns::IsKept(length) || fState.font.Rotation() != 0 || fState.font.Shear() != 90)
		return false;
	const double baseX = (static_cast<double>(where.x) + fState.origin.x) * fScale;
	const double baseY = (static_cast<double>(where.y) + fState.origin.y) * fScale;
	if (!(std::abs(baseX) < kFarthestText && std::abs(baseY) < kFarthestText))
		return false;

	const QPoint pixel(static_cast<int>(std::floor(baseX)), static_cast<int>(std::floor(baseY)));
	const QPointF rest(baseX - pixel.x(), baseY - pixel.y());
	const FontKey key = FontKey::Of(fState.font);
	std::shared_ptr<const TextRun> run = fFonts.Runs().Find(key, text, length);
	if (run == nullptr || run->scale != fScale || run->x != rest.x() || run->y != rest.y()) {
		run = fFonts.MakeRun(key, text, length, fScale, rest);
		if (run == nullptr)
			return false;
	}

	const QRect area = run->area.translated(pixel);
	ForEachSpan(area, [&](int y, int left, int right) {
		const uint8* coverage =
			run->coverage.data() + (y - area.top()) * area.width() + left - area.left();
		PaintTextRow(Row(y) + left, coverage, right - left + 1);
	});
	return true;
}

} // namespace BPrivate
