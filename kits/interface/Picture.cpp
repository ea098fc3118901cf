// SPDX-License-Identifier: MIT
// BPicture, and how views record and play it.
#include <Picture.h>

#include <cstdio>
#include <cstring>
#include <memory>

#include <DataIO.h>
#include <Message.h>
#include <Region.h>
#include <View.h>
#include <Window.h>

#include "display/Canvas.h"
#include "display/Display.h"
#include "display/PixelBuffer.h"
#include "interface/PictureCanvas.h"
#include "interface/ViewPrivate.h"
#include "interface/WindowPrivate.h"

using BPrivate::Canvas;
using BPrivate::PictureCanvas;

namespace {

// The flattened form: this, the number of bytes, the operations.
const uint32 kPictureMagic = 'PlPc';
const uint32 kMaxPictureSize = 256 * 1024 * 1024;

struct PictureHeader {
	uint32 magic;
	uint32 size;
};


status_t
ReadAll(BDataIO* stream, void* buffer, size_t size)
{
	uint8* bytes = static_cast<uint8*>(buffer);
	while (size > 0) {
		ssize_t read = stream->Read(bytes, size);
		if (read < 0)
			return static_cast<status_t>(read);
		if (read == 0)
			return B_BAD_DATA;
		bytes += read;
		size -= read;
	}
	return B_OK;
}


// The pixels that a picture draws on white, or all others.
BRegion
DrawnRegion(const std::vector<uint8>& operations, BRect bounds, BPoint where, bool inverse)
{
	int32 width = bounds.IntegerWidth() + 1, height = bounds.IntegerHeight() + 1;
	std::unique_ptr<Canvas> canvas = BPrivate::Display::Get().MakeCanvas(width, height, 1);
	BRegion all(BRect(0, 0, width - 1, height - 1));
	BPrivate::PlayOperations(operations, canvas.get(), all, where - bounds.LeftTop());
	BPrivate::Picture drawn = canvas->ReadPicture();

	BRegion region;
	for (int32 y = 0; y < drawn.height; y++) {
		const uint32* row = drawn.pixels.data() + static_cast<size_t>(y) * drawn.width;
		int32 start = 0;
		while (start < drawn.width) {
			bool isDrawn = (row[start] & 0xffffff) != 0xffffff;
			int32 end = start;
			while (end < drawn.width && ((row[end] & 0xffffff) != 0xffffff) == isDrawn)
				end++;
			if (isDrawn != inverse)
				region.Include(clipping_rect{start, y, end - 1, y});
			start = end;
		}
	}
	region.OffsetBy(bounds.LeftTop());
	return region;
}

} // namespace


BPicture::BPicture() = default;


BPicture::BPicture(const BPicture& other)
	: BArchivable(),
	  fOperations(other.fOperations)
{
}


BPicture::BPicture(BMessage* archive)
	: BArchivable(archive)
{
	const void* data;
	ssize_t size;
	if (archive->FindData("_data", B_RAW_TYPE, &data, &size) != B_OK)
		return;
	const uint8* bytes = static_cast<const uint8*>(data);
	std::vector<uint8> operations(bytes, bytes + size);
	if (BPrivate::PlayOperations(operations, nullptr, BRegion(), B_ORIGIN) == B_OK)
		fOperations.swap(operations);
}


BPicture::~BPicture() = default;


BArchivable*
BPicture::Instantiate(BMessage* archive)
{
	return validate_instantiation(archive, "BPicture") ? new BPicture(archive) : nullptr;
}


status_t
BPicture::Archive(BMessage* archive, bool deep) const
{
	status_t status = BArchivable::Archive(archive, deep);
	if (status == B_OK && !fOperations.empty())
		status = archive->AddData("_data", B_RAW_TYPE, fOperations.data(), fOperations.size());
	return status;
}


status_t
BPicture::Flatten(BDataIO* stream)
{
	if (stream == nullptr)
		return B_BAD_VALUE;
	PictureHeader header{kPictureMagic, static_cast<uint32>(fOperations.size())};
	ssize_t written = stream->Write(&header, sizeof(header));
	if (written != static_cast<ssize_t>(sizeof(header)))
		return written < 0 ? static_cast<status_t>(written) : B_IO_ERROR;
	written = stream->Write(fOperations.data(), fOperations.size());
	if (written != static_cast<ssize_t>(fOperations.size()))
		return written < 0 ? static_cast<status_t>(written) : B_IO_ERROR;
	return B_OK;
}


status_t
BPicture::Unflatten(BDataIO* stream)
{
	if (stream == nullptr)
		return B_BAD_VALUE;
	PictureHeader header;
	status_t status = ReadAll(stream, &header, sizeof(header));
	if (status != B_OK)
		return status;
	if (header.magic != kPictureMagic || header.size > kMaxPictureSize)
		return B_BAD_DATA;

	// In pieces: a damaged size must not cost memory that the stream does not fill.
	std::vector<uint8> operations;
	while (operations.size() < header.size) {
		size_t before = operations.size();
		operations.resize(std::min<size_t>(header.size, before + 65536));
		status = ReadAll(stream, operations.data() + before, operations.size() - before);
		if (status != B_OK)
			return status;
	}
	status = BPrivate::PlayOperations(operations, nullptr, BRegion(), B_ORIGIN);
	if (status == B_OK)
		fOperations.swap(operations);
	return status;
}


void
BView::BeginPicture(BPicture* a_picture)
{
	if (a_picture != nullptr)
		a_picture->fOperations.clear();
	AppendToPicture(a_picture);
}


void
BView::AppendToPicture(BPicture* a_picture)
{
	CheckLock();
	if (a_picture == nullptr)
		return;
	BPrivate::Recording recording;
	recording.picture = a_picture;
	recording.canvas = std::make_unique<PictureCanvas>(&a_picture->fOperations);
	Drawing().recordings.push_back(std::move(recording));
}


BPicture*
BView::EndPicture()
{
	CheckLock();
	if (fDrawing == nullptr || fDrawing->recordings.empty())
		return nullptr;
	BPicture* picture = fDrawing->recordings.back().picture;
	fDrawing->recordings.pop_back();
	return picture;
}


void
BView::DrawPicture(const BPicture* a_picture)
{
	DrawPicture(a_picture, PenLocation());
}


void
BView::DrawPicture(const BPicture* a_picture, BPoint where)
{
	Canvas* canvas = BeginDrawing();
	if (canvas == nullptr || a_picture == nullptr)
		return;

	const BPrivate::GraphicsState& state = State();
	BPoint offset = where + state.baseOrigin + state.origin;
	if (IsRecording()) {
		BRegion everything(BRect(-1e6f, -1e6f, 1e6f, 1e6f));
		BPrivate::PlayOperations(a_picture->fOperations, canvas, everything, offset);
		fDrawing->serial++;
		return;
	}
	BPrivate::WindowPainter& painter = fOwner->fData->painter;
	BRegion clip = painter.Clip();
	BPrivate::PlayOperations(a_picture->fOperations, canvas, clip, offset + OffsetInWindow());
	painter.Forget();
	EndDrawing(fBounds.OffsetByCopy(-state.baseOrigin - state.origin));
}


void
BView::DrawPicture(const char* filename, long offset, BPoint where)
{
	std::unique_ptr<std::FILE, int (*)(std::FILE*)> file(
		filename != nullptr ? std::fopen(filename, "rb") : nullptr, &std::fclose);
	if (file == nullptr || std::fseek(file.get(), offset, SEEK_SET) != 0)
		return;

	class FileIO : public BDataIO {
	public:
		FileIO(std::FILE* file)
			: fFile(file)
		{
		}
		ssize_t Read(void* buffer, size_t size) override
		{
			return static_cast<ssize_t>(std::fread(buffer, 1, size, fFile));
		}
		ssize_t Write(const void*, size_t) override { return B_NOT_ALLOWED; }

	private:
		std::FILE* fFile;
	};
	FileIO stream(file.get());
	BPicture picture;
	if (picture.Unflatten(&stream) == B_OK)
		DrawPicture(&picture, where);
}


void
BView::DrawPictureAsync(const BPicture* a_picture)
{
	DrawPicture(a_picture);
}


void
BView::DrawPictureAsync(const BPicture* a_picture, BPoint where)
{
	DrawPicture(a_picture, where);
}


void
BView::DrawPictureAsync(const char* filename, long offset, BPoint where)
{
	DrawPicture(filename, offset, where);
}


void
BView::ClipToPicture(BPicture* picture, BPoint where, bool)
{
	ClipTo(picture, where, false);
}


void
BView::ClipToInversePicture(BPicture* picture, BPoint where, bool)
{
	ClipTo(picture, where, true);
}


void
BView::ClipTo(BPicture* picture, BPoint where, bool inverse)
{
	CheckLock();
	if (picture == nullptr) {
		ConstrainClippingRegion(nullptr);
		return;
	}
	if (!fBounds.IsValid() || !BPrivate::Display::Get().DrawsPixels())
		return;
	BRegion region = DrawnRegion(picture->fOperations, fBounds, where, inverse);
	ConstrainClippingRegion(&region);
}
