// SPDX-License-Identifier: MIT

#include "TextStyles.h"

#include <algorithm>

namespace BPrivate {

void
TextStyle::Apply(const BFont* newFont, uint32 mask, const rgb_color* newColor)
{
	if (newColor != nullptr)
		color = *newColor;
	if (newFont == nullptr)
		return;
	if ((mask & B_FONT_ALL) == B_FONT_ALL) {
		font = *newFont;
		return;
	}
	if ((mask & B_FONT_FAMILY_AND_STYLE) != 0)
		font.SetFamilyAndStyle(newFont->FamilyAndStyle());
	if ((mask & B_FONT_SIZE) != 0)
		font.SetSize(newFont->Size());
	if ((mask & B_FONT_SHEAR) != 0)
		font.SetShear(newFont->Shear());
	if ((mask & B_FONT_ROTATION) != 0)
		font.SetRotation(newFont->Rotation());
	if ((mask & B_FONT_SPACING) != 0)
		font.SetSpacing(newFont->Spacing());
	if ((mask & B_FONT_ENCODING) != 0)
		font.SetEncoding(newFont->Encoding());
	if ((mask & B_FONT_FACE) != 0)
		font.SetFace(newFont->Face());
	if ((mask & B_FONT_FLAGS) != 0)
		font.SetFlags(newFont->Flags());
}


TextStyles::TextStyles(const TextStyle& style)
	: fRuns{{0, style}},
	  fLength(0)
{
}


int32
TextStyles::IndexAt(int32 offset) const
{
	const auto next = std::upper_bound(fRuns.begin(), fRuns.end(), offset,
		[](int32 place, const Run& run) { return place < run.offset; });
	return std::max(static_cast<int32>(next - fRuns.begin()) - 1, int32(0));
}


void
TextStyles::SetAll(const TextStyle& style)
{
	fRuns.assign(1, {0, style});
}


void
TextStyles::Insert(int32 offset, int32 length, const TextStyle& style)
{
	if (length <= 0)
		return;
	const int32 index = SplitAt(offset);
	for (size_t i = static_cast<size_t>(index); i < fRuns.size(); i++)
		fRuns[i].offset += length;
	fRuns.insert(fRuns.begin() + index, {offset, style});
	fLength += length;
	Join();
}


void
TextStyles::Remove(int32 from, int32 to)
{
	if (from >= to)
		return;
	const int32 first = SplitAt(from);
	const int32 last = SplitAt(to);
	// An emptied text keeps the style that it began with.
	const TextStyle kept = fRuns[first].style;
	fRuns.erase(fRuns.begin() + first, fRuns.begin() + last);
	for (size_t i = static_cast<size_t>(first); i < fRuns.size(); i++)
		fRuns[i].offset -= to - from;
	fLength = std::max(fLength - (to - from), int32(0));
	if (fLength == 0)
		SetAll(kept);
	else
		Join();
}


void
TextStyles::Set(int32 from, int32 to, const TextStyle& style)
{
	if (from >= to)
		return;
	const int32 first = SplitAt(from);
	const int32 last = SplitAt(to);
	fRuns.erase(fRuns.begin() + first, fRuns.begin() + last);
	fRuns.insert(fRuns.begin() + first, {from, style});
	Join();
}


void
TextStyles::Apply(int32 from, int32 to, const BFont* font, uint32 mask, const rgb_color* color)
{
	if (from >= to)
		return;
	const int32 first = SplitAt(from);
	const int32 last = SplitAt(to);
	for (int32 i = first; i < last; i++)
		fRuns[i].style.Apply(font, mask, color);
	Join();
}


void
TextStyles::SetRuns(int32 from, int32 to, const text_run_array& runs)
{
	std::vector<Run> inserted;
	for (int32 i = 0; i < runs.count; i++) {
		const text_run& run = runs.runs[i];
		const int64 offset = from + (inserted.empty() ? 0 : int64(run.offset));
		if (offset >= to || (!inserted.empty() && offset < inserted.back().offset))
			continue;
		const Run style = {static_cast<int32>(offset), {run.font, run.color}};
		// Of two at the same place the later one counts.
		if (!inserted.empty() && inserted.back().offset == offset)
			inserted.back() = style;
		else
			inserted.push_back(style);
	}
	if (inserted.empty() || from >= to)
		return;
	const int32 first = SplitAt(from);
	const int32 last = SplitAt(to);
	fRuns.erase(fRuns.begin() + first, fRuns.begin() + last);
	fRuns.insert(fRuns.begin() + first, inserted.begin(), inserted.end());
	Join();
}


// Makes a run begin at \a offset, for a moment with the style of the one before. Its index.
int32
TextStyles::SplitAt(int32 offset)
{
	const int32 index = IndexAt(offset);
	if (fRuns[index].offset == offset)
		return index;
	fRuns.insert(fRuns.begin() + index + 1, {offset, fRuns[index].style});
	return index + 1;
}


void
TextStyles::Join()
{
	size_t kept = 0;
	for (size_t i = 1; i < fRuns.size(); i++) {
		if (!(fRuns[i].style == fRuns[kept].style))
			fRuns[++kept] = fRuns[i];
	}
	// Nothing is left of a style behind the end.
	while (kept > 0 && fRuns[kept].offset >= fLength)
		kept--;
	fRuns.resize(kept + 1, fRuns[0]);
}


RunArray
CopyRuns(const TextStyles& styles, int32 from, int32 to)
{
	const int32 first = styles.IndexAt(from);
	const int32 last = std::max(styles.IndexAt(std::max(to - 1, from)), first);
	RunArray runs(BTextView::AllocRunArray(last - first + 1));
	if (runs == nullptr)
		return runs;
	for (int32 i = first; i <= last; i++) {
		const TextStyles::Run& run = styles.Runs()[i];
		runs->runs[i - first] = {
			std::max(run.offset - from, int32(0)), run.style.font, run.style.color};
	}
	return runs;
}


RunArray
JoinRuns(const text_run_array& first, int32 firstLength, const text_run_array& second)
{
	RunArray runs(BTextView::CopyRunArray(&first, second.count));
	if (runs == nullptr)
		return runs;
	for (int32 i = 0; i < second.count; i++) {
		runs->runs[first.count + i] = second.runs[i];
		runs->runs[first.count + i].offset += firstLength;
	}
	return runs;
}

} // namespace BPrivate
