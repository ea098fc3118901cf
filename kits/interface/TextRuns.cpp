// SPDX-License-Identifier: MIT
// BTextView: run arrays, in memory and flattened.
#include <TextView.h>

#include <algorithm>
#include <cstddef>
#include <cstdlib>
#include <cstring>
#include <new>

#include <ByteOrder.h>

#include "TextStyles.h"

namespace {

// The form that other programs of the platform read from the clipboard: all numbers big endian.
constexpr uint32 kFlatMagic = 'Ali!';
constexpr uint32 kFlatVersion = 0;

struct FlatHeader {
	uint32 magic;
	uint32 version;
	int32 count;
};

struct FlatRun {
	int32 offset;
	char family[B_FONT_FAMILY_LENGTH + 1];
	char style[B_FONT_STYLE_LENGTH + 1];
	float size;
	float shear;
	uint16 face;
	uint8 red;
	uint8 green;
	uint8 blue;
	uint8 alpha;
	uint16 reserved;
};

// Beyond this a count comes from damaged data.
constexpr int32 kMostRuns = 10000000;


size_t
ArraySize(int32 count)
{
	return offsetof(text_run_array, runs) + static_cast<size_t>(count) * sizeof(text_run);
}


void
CopyName(char* to, const char* from, size_t size)
{
	memset(to, 0, size);
	memcpy(to, from, strnlen(from, size - 1));
}

} // namespace


text_run_array*
BTextView::AllocRunArray(int32 entryCount, int32* outSize)
{
	if (entryCount < 0 || entryCount > kMostRuns)
		return NULL;
	// The array has room for one run at least.
	const size_t size = ArraySize(entryCount > 0 ? entryCount : 1);
	void* memory = calloc(size, 1);
	if (memory == NULL)
		return NULL;
	text_run_array* runs = static_cast<text_run_array*>(memory);
	runs->count = entryCount;
	for (int32 i = 0; i < entryCount; i++)
		new (&runs->runs[i].font) BFont;
	if (outSize != NULL)
		*outSize = static_cast<int32>(size);
	return runs;
}


text_run_array*
BTextView::CopyRunArray(const text_run_array* original, int32 countDelta)
{
	if (original == NULL || original->count + countDelta < 0)
		return NULL;
	const int32 count = original->count + countDelta;
	text_run_array* copy = AllocRunArray(count);
	for (int32 i = 0; copy != NULL && i < count && i < original->count; i++)
		copy->runs[i] = original->runs[i];
	return copy;
}


void
BTextView::FreeRunArray(text_run_array* array)
{
	if (array == NULL)
		return;
	for (int32 i = 0; i < array->count; i++)
		array->runs[i].font.~BFont();
	free(array);
}


void*
BTextView::FlattenRunArray(const text_run_array* runArray, int32* _size)
{
	if (runArray == NULL || runArray->count < 0 || runArray->count > kMostRuns)
		return NULL;
	const size_t size = BPrivate::FlatRunsSize(runArray->count);
	char* memory = static_cast<char*>(calloc(size, 1));
	if (memory == NULL)
		return NULL;

	const FlatHeader header = {B_HOST_TO_BENDIAN_INT32(kFlatMagic),
		B_HOST_TO_BENDIAN_INT32(kFlatVersion),
		static_cast<int32>(B_HOST_TO_BENDIAN_INT32(runArray->count))};
	memcpy(memory, &header, sizeof(header));
	for (int32 i = 0; i < runArray->count; i++) {
		const text_run& run = runArray->runs[i];
		font_family family;
		font_style style;
		run.font.GetFamilyAndStyle(&family, &style);
		FlatRun flat = {};
		flat.offset = static_cast<int32>(B_HOST_TO_BENDIAN_INT32(run.offset));
		CopyName(flat.family, family, sizeof(flat.family));
		CopyName(flat.style, style, sizeof(flat.style));
		flat.size = B_HOST_TO_BENDIAN_FLOAT(run.font.Size());
		flat.shear = B_HOST_TO_BENDIAN_FLOAT(run.font.Shear());
		flat.face = B_HOST_TO_BENDIAN_INT16(run.font.Face());
		flat.red = run.color.red;
		flat.green = run.color.green;
		flat.blue = run.color.blue;
		flat.alpha = 255;
		memcpy(memory + sizeof(FlatHeader) + static_cast<size_t>(i) * sizeof(FlatRun), &flat,
			sizeof(flat));
	}
	if (_size != NULL)
		*_size = static_cast<int32>(size);
	return memory;
}


text_run_array*
BTextView::UnflattenRunArray(const void* data, int32* _size)
{
	if (data == NULL)
		return NULL;
	FlatHeader header;
	memcpy(&header, data, sizeof(header));
	const int32 count =
		static_cast<int32>(B_BENDIAN_TO_HOST_INT32(static_cast<uint32>(header.count)));
	if (B_BENDIAN_TO_HOST_INT32(header.magic) != kFlatMagic
		|| B_BENDIAN_TO_HOST_INT32(header.version) != kFlatVersion || count < 0)
		return NULL;
	text_run_array* runs = AllocRunArray(count, _size);
	if (runs == NULL)
		return NULL;

	for (int32 i = 0; i < count; i++) {
		FlatRun flat;
		memcpy(&flat,
			static_cast<const char*>(data) + sizeof(FlatHeader)
				+ static_cast<size_t>(i) * sizeof(FlatRun),
			sizeof(flat));
		flat.family[sizeof(flat.family) - 1] = '\0';
		flat.style[sizeof(flat.style) - 1] = '\0';
		text_run& run = runs->runs[i];
		run.offset = static_cast<int32>(B_BENDIAN_TO_HOST_INT32(static_cast<uint32>(flat.offset)));
		// A font that is not there leaves the plain one.
		run.font.SetFamilyAndStyle(flat.family, flat.style);
		const float size = B_BENDIAN_TO_HOST_FLOAT(flat.size);
		if (size >= 1 && size <= 1000)
			run.font.SetSize(size);
		const float shear = B_BENDIAN_TO_HOST_FLOAT(flat.shear);
		if (shear >= 45 && shear <= 135)
			run.font.SetShear(shear);
		run.font.SetFace(B_BENDIAN_TO_HOST_INT16(flat.face));
		run.color = make_color(flat.red, flat.green, flat.blue);
	}
	return runs;
}


void
BTextView::SetRunArray(int32 startOffset, int32 endOffset, const text_run_array* runs)
{
	const int32 start = std::clamp<int32>(startOffset, 0, TextLength());
	const int32 end = std::clamp<int32>(endOffset, 0, TextLength());
	if (runs == NULL || start >= end)
		return;
	ApplyRuns(start, end, runs);
	StylesChanged(start, end);
}


text_run_array*
BTextView::RunArray(int32 startOffset, int32 endOffset, int32* _size) const
{
	const int32 start = std::clamp<int32>(startOffset, 0, TextLength());
	const int32 end = std::clamp<int32>(endOffset, start, TextLength());
	BPrivate::RunArray runs = BPrivate::CopyRuns(*fStyles, start, end);
	if (runs != NULL && _size != NULL)
		*_size = static_cast<int32>(ArraySize(runs->count));
	return runs.release();
}


namespace BPrivate {

size_t
FlatRunsSize(int32 count)
{
	return sizeof(FlatHeader) + static_cast<size_t>(count) * sizeof(FlatRun);
}


RunArray
ReadFlatRuns(const void* data, ssize_t size)
{
	FlatHeader header;
	if (data == nullptr || size < static_cast<ssize_t>(sizeof(header)))
		return nullptr;
	memcpy(&header, data, sizeof(header));
	const int32 count =
		static_cast<int32>(B_BENDIAN_TO_HOST_INT32(static_cast<uint32>(header.count)));
	if (count < 0 || FlatRunsSize(count) > static_cast<size_t>(size))
		return nullptr;
	return RunArray(BTextView::UnflattenRunArray(data, nullptr));
}

} // namespace BPrivate
