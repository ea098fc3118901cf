// SPDX-License-Identifier: MIT
// PictureCanvas: recording drawing operations, and playing them.
#include "interface/PictureCanvas.h"

#include <cstring>

#include <Errors.h>

#include "display/PixelBuffer.h"
#include "interface/ArchivedEnum.h"

namespace BPrivate {

namespace {

enum Code : uint8 {
	kState,
	kFont,
	kNoClip,
	kClip,
	kStrokeLine,
	kColoredLine,
	kStrokeRect,
	kFillRect,
	kInvertRect,
	kFillRegion,
	kStrokeRoundRect,
	kFillRoundRect,
	kStrokeEllipse,
	kFillEllipse,
	kStrokeArc,
	kFillArc,
	kStrokePolygon,
	kFillPolygon,
	kStrokePath,
	kFillPath,
	kDrawString,
	kDrawPlacedString,
	kDrawBitmap,
	kCopyBits
};


/// CanvasState without its font, whose numbers mean nothing to another program.
struct RecordedState {
	rgb_color highColor;
	rgb_color lowColor;
	int32 mode;
	int32 alphaSource;
	int32 alphaFunction;
	float penSize;
	int32 lineCap;
	int32 lineJoin;
	float miterLimit;
	int32 fillRule;
	BPoint origin;
};


struct RecordedFont {
	font_family family;
	font_style style;
	float size;
	float shear;
	float rotation;
	uint32 flags;
	uint16 face;
	uint8 spacing;
	uint8 encoding;
};


/// Reads values; after one that is not there all fail.
class OperationReader {
public:
	explicit OperationReader(const std::vector<uint8>& bytes)
		: fBytes(bytes)
	{
	}

	bool IsGood() const { return fIsGood; }
	bool AtEnd() const { return fPosition == fBytes.size(); }

	template <typename Value>
	Value Get()
	{
		Value value{};
		if (const uint8* bytes = GetBytes(sizeof(Value)))
			std::memcpy(static_cast<void*>(&value), bytes, sizeof(Value));
		return value;
	}

	const uint8* GetBytes(size_t size)
	{
		if (!fIsGood || size > fBytes.size() - fPosition) {
			fIsGood = false;
			return nullptr;
		}
		const uint8* bytes = fBytes.data() + fPosition;
		fPosition += size;
		return bytes;
	}

	template <typename Item>
	std::vector<Item> GetArray()
	{
		uint32 count = Get<uint32>();
		std::vector<Item> items;
		if (count > fBytes.size() / sizeof(Item)) {
			fIsGood = false;
			return items;
		}
		const uint8* bytes = GetBytes(count * sizeof(Item));
		if (bytes != nullptr && count != 0) {
			items.resize(count);
			std::memcpy(static_cast<void*>(items.data()), bytes, count * sizeof(Item));
		}
		return items;
	}

	void Fail() { fIsGood = false; }

private:
	const std::vector<uint8>& fBytes;
	size_t fPosition = 0;
	bool fIsGood = true;
};


BRegion
GetRegion(OperationReader& reader)
{
	BRegion region;
	for (const clipping_rect& rect : reader.GetArray<clipping_rect>())
		region.Include(rect);
	return region;
}


CanvasPath
GetPath(OperationReader& reader)
{
	CanvasPath path;
	for (uint8 kind : reader.GetArray<uint8>())
		path.kinds.push_back(static_cast<CanvasPath::Kind>(kind));
	path.points = reader.GetArray<BPoint>();

	size_t needed = 0;
	for (CanvasPath::Kind kind : path.kinds) {
		if (kind > CanvasPath::kClose)
			reader.Fail();
		needed += kind == CanvasPath::kBezierTo ? 3 : kind == CanvasPath::kClose ? 0 : 1;
	}
	if (needed != path.points.size())
		reader.Fail();
	return path;
}


class OperationPlayer {
public:
	OperationPlayer(
		const std::vector<uint8>& operations, Canvas* canvas, const BRegion& clip, BPoint offset)
		: fReader(operations),
		  fCanvas(canvas),
		  fClip(clip),
		  fOffset(offset)
	{
	}

	status_t Play()
	{
		if (fCanvas != nullptr)
			fCanvas->SetClip(&fClip);
		while (!fReader.AtEnd()) {
			uint8 code = fReader.Get<uint8>();
			if (!PlayOne(code) || !fReader.IsGood())
				return B_BAD_DATA;
		}
		return B_OK;
	}

private:
	// Arguments are read in order before anything is drawn with them.
	template <typename Draw>
	void DrawIfGood(Draw draw)
	{
		if (fReader.IsGood() && fCanvas != nullptr)
			draw(*fCanvas);
	}

	bool PlayOne(uint8 code);
	bool PlayShape(uint8 code);
	bool PlayContent(uint8 code);
	void PlayState();
	void PlayFont();

	OperationReader fReader;
	Canvas* fCanvas;
	const BRegion& fClip;
	BPoint fOffset;
	CanvasState fState;
};


bool
OperationPlayer::PlayOne(uint8 code)
{
	switch (code) {
		case kState:
			PlayState();
			return true;

		case kFont:
			PlayFont();
			return true;

		case kNoClip:
			DrawIfGood([&](Canvas& canvas) { canvas.SetClip(&fClip); });
			return true;

		case kClip:
		{
			BRegion clip = GetRegion(fReader);
			clip.OffsetBy(fOffset);
			clip.IntersectWith(&fClip);
			DrawIfGood([&](Canvas& canvas) { canvas.SetClip(&clip); });
			return true;
		}

		default:
			return PlayShape(code) || PlayContent(code);
	}
}


void
OperationPlayer::PlayState()
{
	RecordedState recorded = fReader.Get<RecordedState>();
	fState.highColor = recorded.highColor;
	fState.lowColor = recorded.lowColor;
	fState.mode = EnumBetween(recorded.mode, B_OP_COPY, B_OP_ALPHA, B_OP_COPY);
	fState.alphaSource =
		EnumBetween(recorded.alphaSource, B_PIXEL_ALPHA, B_CONSTANT_ALPHA, B_PIXEL_ALPHA);
	fState.alphaFunction = EnumBetween(
		recorded.alphaFunction, B_ALPHA_OVERLAY, B_ALPHA_COMPOSITE_DARKEN, B_ALPHA_OVERLAY);
	fState.penSize = recorded.penSize;
	fState.lineCap =
		EnumAmong(recorded.lineCap, {B_ROUND_CAP, B_BUTT_CAP, B_SQUARE_CAP}, B_BUTT_CAP);
	fState.lineJoin = EnumBetween(recorded.lineJoin, B_ROUND_JOIN, B_SQUARE_JOIN, B_MITER_JOIN);
	fState.miterLimit = recorded.miterLimit;
	fState.fillRule = recorded.fillRule;
	fState.origin = recorded.origin + fOffset;
	if (recorded.mode != fState.mode || recorded.alphaSource != fState.alphaSource
		|| recorded.alphaFunction != fState.alphaFunction || recorded.lineCap != fState.lineCap
		|| recorded.lineJoin != fState.lineJoin)
		fReader.Fail();
	DrawIfGood([&](Canvas& canvas) { canvas.SetState(fState); });
}


void
OperationPlayer::PlayFont()
{
	RecordedFont recorded = fReader.Get<RecordedFont>();
	recorded.family[B_FONT_FAMILY_LENGTH] = '\0';
	recorded.style[B_FONT_STYLE_LENGTH] = '\0';
	BFont font;
	// A font that this program does not have stays the plain one.
	if (fCanvas != nullptr && font.SetFamilyAndStyle(recorded.family, recorded.style) != B_OK)
		font.SetFace(recorded.face);
	font.SetSize(recorded.size);
	font.SetShear(recorded.shear);
	font.SetRotation(recorded.rotation);
	font.SetFlags(recorded.flags);
	font.SetSpacing(recorded.spacing);
	font.SetEncoding(recorded.encoding);
	fState.font = font;
	DrawIfGood([&](Canvas& canvas) { canvas.SetState(fState); });
}


bool
OperationPlayer::PlayShape(uint8 code)
{
	switch (code) {
		case kStrokeLine:
		{
			BPoint start = fReader.Get<BPoint>(), end = fReader.Get<BPoint>();
			pattern pattern = fReader.Get<::pattern>();
			DrawIfGood([&](Canvas& canvas) { canvas.StrokeLine(start, end, pattern); });
			return true;
		}

		case kColoredLine:
		{
			BPoint start = fReader.Get<BPoint>(), end = fReader.Get<BPoint>();
			rgb_color color = fReader.Get<rgb_color>();
			DrawIfGood([&](Canvas& canvas) { canvas.StrokeLine(start, end, color); });
			return true;
		}

		case kStrokeRect:
		case kFillRect:
		case kStrokeEllipse:
		case kFillEllipse:
		{
			BRect rect = fReader.Get<BRect>();
			pattern pattern = fReader.Get<::pattern>();
			DrawIfGood([&](Canvas& canvas) {
				if (code == kStrokeRect)
					canvas.StrokeRect(rect, pattern);
				else if (code == kFillRect)
					canvas.FillRect(rect, pattern);
				else if (code == kStrokeEllipse)
					canvas.StrokeEllipse(rect, pattern);
				else
					canvas.FillEllipse(rect, pattern);
			});
			return true;
		}

		case kStrokeRoundRect:
		case kFillRoundRect:
		case kStrokeArc:
		case kFillArc:
		{
			BRect rect = fReader.Get<BRect>();
			float first = fReader.Get<float>(), second = fReader.Get<float>();
			pattern pattern = fReader.Get<::pattern>();
			DrawIfGood([&](Canvas& canvas) {
				if (code == kStrokeRoundRect)
					canvas.StrokeRoundRect(rect, first, second, pattern);
				else if (code == kFillRoundRect)
					canvas.FillRoundRect(rect, first, second, pattern);
				else if (code == kStrokeArc)
					canvas.StrokeArc(rect, first, second, pattern);
				else
					canvas.FillArc(rect, first, second, pattern);
			});
			return true;
		}

		case kStrokePolygon:
		case kFillPolygon:
		{
			bool closed = fReader.Get<uint8>() != 0;
			pattern pattern = fReader.Get<::pattern>();
			std::vector<BPoint> points = fReader.GetArray<BPoint>();
			int32 count = static_cast<int32>(points.size());
			DrawIfGood([&](Canvas& canvas) {
				if (code == kStrokePolygon)
					canvas.StrokePolygon(points.data(), count, closed, pattern);
				else
					canvas.FillPolygon(points.data(), count, pattern);
			});
			return true;
		}

		case kStrokePath:
		case kFillPath:
		{
			pattern pattern = fReader.Get<::pattern>();
			CanvasPath path = GetPath(fReader);
			DrawIfGood([&](Canvas& canvas) {
				if (code == kStrokePath)
					canvas.StrokePath(path, pattern);
				else
					canvas.FillPath(path, pattern);
			});
			return true;
		}

		default:
			return false;
	}
}


bool
OperationPlayer::PlayContent(uint8 code)
{
	switch (code) {
		case kInvertRect:
		{
			BRect rect = fReader.Get<BRect>();
			DrawIfGood([&](Canvas& canvas) { canvas.InvertRect(rect); });
			return true;
		}

		case kFillRegion:
		{
			pattern pattern = fReader.Get<::pattern>();
			BRegion region = GetRegion(fReader);
			DrawIfGood([&](Canvas& canvas) { canvas.FillRegion(region, pattern); });
			return true;
		}

		case kDrawString:
		{
			BPoint where = fReader.Get<BPoint>();
			escapement_delta delta = fReader.Get<escapement_delta>();
			std::vector<char> text = fReader.GetArray<char>();
			DrawIfGood([&](Canvas& canvas) {
				canvas.DrawString(text.data(), static_cast<int32>(text.size()), where, &delta);
			});
			return true;
		}

		case kDrawPlacedString:
		{
			std::vector<BPoint> places = fReader.GetArray<BPoint>();
			std::vector<char> text = fReader.GetArray<char>();
			DrawIfGood([&](Canvas& canvas) {
				canvas.DrawString(text.data(), static_cast<int32>(text.size()), places.data(),
					static_cast<int32>(places.size()));
			});
			return true;
		}

		case kDrawBitmap:
		{
			BRect source = fReader.Get<BRect>(), destination = fReader.Get<BRect>();
			uint32 options = fReader.Get<uint32>();
			int32 width = fReader.Get<int32>(), height = fReader.Get<int32>();
			bool hasAlpha = fReader.Get<uint8>() != 0;
			std::vector<uint32> pixels = fReader.GetArray<uint32>();
			if (width <= 0 || height <= 0 || static_cast<uint64>(width) * height != pixels.size())
				fReader.Fail();
			DrawIfGood([&](Canvas& canvas) {
				PixelBuffer buffer{pixels.data(), width, height, width * 4, hasAlpha};
				canvas.DrawBitmap(buffer, source, destination, options);
			});
			return true;
		}

		case kCopyBits:
		{
			BRect source = fReader.Get<BRect>(), destination = fReader.Get<BRect>();
			DrawIfGood([&](Canvas& canvas) { canvas.CopyBits(source, destination); });
			return true;
		}

		default:
			return false;
	}
}

} // namespace


PictureCanvas::PictureCanvas(std::vector<uint8>* operations)
	: fOperations(operations)
{
}


void
PictureCanvas::PutBytes(const void* bytes, size_t size)
{
	const uint8* from = static_cast<const uint8*>(bytes);
	fOperations->insert(fOperations->end(), from, from + size);
}


template <typename Value>
void
PictureCanvas::Put(const Value& value)
{
	PutBytes(&value, sizeof(Value));
}


template <typename... Values>
void
PictureCanvas::Record(uint8 code, const Values&... values)
{
	Put(code);
	(Put(values), ...);
}


void
PictureCanvas::PutPoints(const BPoint* points, int32 count)
{
	Put(static_cast<uint32>(count));
	PutBytes(points, count * sizeof(BPoint));
}


void
PictureCanvas::PutPath(const CanvasPath& path)
{
	Put(static_cast<uint32>(path.kinds.size()));
	PutBytes(path.kinds.data(), path.kinds.size());
	PutPoints(path.points.data(), static_cast<int32>(path.points.size()));
}


void
PictureCanvas::SetState(const CanvasState& state)
{
	RecordedState recorded{state.highColor, state.lowColor, state.mode, state.alphaSource,
		state.alphaFunction, state.penSize, state.lineCap, state.lineJoin, state.miterLimit,
		state.fillRule, state.origin};
	Record(kState, recorded);
	if (state.font == fFont)
		return;

	fFont = state.font;
	RecordedFont font = {};
	fFont.GetFamilyAndStyle(&font.family, &font.style);
	font.size = fFont.Size();
	font.shear = fFont.Shear();
	font.rotation = fFont.Rotation();
	font.flags = fFont.Flags();
	font.face = fFont.Face();
	font.spacing = fFont.Spacing();
	font.encoding = fFont.Encoding();
	Record(kFont, font);
}


void
PictureCanvas::SetClip(const BRegion* clip)
{
	if (clip == nullptr) {
		Record(kNoClip);
		return;
	}
	Record(kClip, static_cast<uint32>(clip->CountRects()));
	for (int32 i = 0; i < clip->CountRects(); i++)
		Put(clip->RectAtInt(i));
}


void
PictureCanvas::StrokeLine(BPoint start, BPoint end, const pattern& pattern)
{
	Record(kStrokeLine, start, end, pattern);
}


void
PictureCanvas::StrokeLine(BPoint start, BPoint end, rgb_color color)
{
	Record(kColoredLine, start, end, color);
}


void
PictureCanvas::StrokeRect(BRect rect, const pattern& pattern)
{
	Record(kStrokeRect, rect, pattern);
}


void
PictureCanvas::FillRect(BRect rect, const pattern& pattern)
{
	Record(kFillRect, rect, pattern);
}


void
PictureCanvas::InvertRect(BRect rect)
{
	Record(kInvertRect, rect);
}


void
PictureCanvas::FillRegion(const BRegion& region, const pattern& pattern)
{
	Record(kFillRegion, pattern, static_cast<uint32>(region.CountRects()));
	for (int32 i = 0; i < region.CountRects(); i++)
		Put(region.RectAtInt(i));
}


void
PictureCanvas::StrokeRoundRect(BRect rect, float xRadius, float yRadius, const pattern& pattern)
{
	Record(kStrokeRoundRect, rect, xRadius, yRadius, pattern);
}


void
PictureCanvas::FillRoundRect(BRect rect, float xRadius, float yRadius, const pattern& pattern)
{
	Record(kFillRoundRect, rect, xRadius, yRadius, pattern);
}


void
PictureCanvas::StrokeEllipse(BRect rect, const pattern& pattern)
{
	Record(kStrokeEllipse, rect, pattern);
}


void
PictureCanvas::FillEllipse(BRect rect, const pattern& pattern)
{
	Record(kFillEllipse, rect, pattern);
}


void
PictureCanvas::StrokeArc(BRect rect, float startAngle, float arcAngle, const pattern& pattern)
{
	Record(kStrokeArc, rect, startAngle, arcAngle, pattern);
}


void
PictureCanvas::FillArc(BRect rect, float startAngle, float arcAngle, const pattern& pattern)
{
	Record(kFillArc, rect, startAngle, arcAngle, pattern);
}


void
PictureCanvas::StrokePolygon(const BPoint* points, int32 count, bool closed, const pattern& pattern)
{
	Record(kStrokePolygon, static_cast<uint8>(closed), pattern);
	PutPoints(points, count);
}


void
PictureCanvas::FillPolygon(const BPoint* points, int32 count, const pattern& pattern)
{
	Record(kFillPolygon, static_cast<uint8>(true), pattern);
	PutPoints(points, count);
}


void
PictureCanvas::StrokePath(const CanvasPath& path, const pattern& pattern)
{
	Record(kStrokePath, pattern);
	PutPath(path);
}


void
PictureCanvas::FillPath(const CanvasPath& path, const pattern& pattern)
{
	Record(kFillPath, pattern);
	PutPath(path);
}


BPoint
PictureCanvas::DrawString(
	const char* text, int32 length, BPoint where, const escapement_delta* delta)
{
	const escapement_delta none = {0, 0};
	const escapement_delta& extra = delta != nullptr ? *delta : none;
	Record(kDrawString, where, extra, static_cast<uint32>(length));
	PutBytes(text, length);

	BPoint end = where + BPoint(fFont.StringWidth(text, length), 0);
	for (int32 i = 0; i < length; i++) {
		if ((text[i] & 0xc0) != 0x80)
			end.x += text[i] == ' ' ? extra.space : extra.nonspace;
	}
	return end;
}


void
PictureCanvas::DrawString(const char* text, int32 length, const BPoint* locations, int32 count)
{
	Record(kDrawPlacedString);
	PutPoints(locations, count);
	Put(static_cast<uint32>(length));
	PutBytes(text, length);
}


void
PictureCanvas::DrawBitmap(
	const PixelBuffer& bitmap, BRect source, BRect destination, uint32 options)
{
	Record(kDrawBitmap, source, destination, options, bitmap.width, bitmap.height,
		static_cast<uint8>(bitmap.hasAlpha), static_cast<uint32>(bitmap.width * bitmap.height));
	for (int32 y = 0; y < bitmap.height; y++)
		PutBytes(
			static_cast<const uint8*>(bitmap.bits) + static_cast<size_t>(y) * bitmap.bytesPerRow,
			static_cast<size_t>(bitmap.width) * 4);
}


void
PictureCanvas::CopyBits(BRect source, BRect destination)
{
	Record(kCopyBits, source, destination);
}


rgb_color
PictureCanvas::PixelAt(BPoint) const
{
	return {0, 0, 0, 0};
}


Picture
PictureCanvas::ReadPicture() const
{
	return Picture();
}


status_t
PlayOperations(
	const std::vector<uint8>& operations, Canvas* canvas, const BRegion& clip, BPoint offset)
{
	return OperationPlayer(operations, canvas, clip, offset).Play();
}

} // namespace BPrivate
