// SPDX-License-Identifier: MIT
// Which font and colour each part of a text has.
#ifndef KITS_INTERFACE_TEXT_STYLES_H
#define KITS_INTERFACE_TEXT_STYLES_H

#include <memory>
#include <vector>

#include <TextView.h>

namespace BPrivate {

struct TextStyle {
	BFont font;
	rgb_color color;

	bool operator==(const TextStyle& other) const
	{
		return font == other.font && color == other.color;
	}

	/// Takes over what \a mask (B_FONT_FAMILY_AND_STYLE, ...) names of \a newFont, and the colour. Both may
	/// be null.
	void Apply(const BFont* newFont, uint32 mask, const rgb_color* newColor);
};


/// The styles of a text, which follow each other from offset 0 on. Offsets are bytes of the text.
class TextStyles {
public:
	/// A style from an offset up to the next one's.
	struct Run {
		int32 offset;
		TextStyle style;
	};

	explicit TextStyles(const TextStyle& style);

	const std::vector<Run>& Runs() const { return fRuns; }
	/// The run that the byte at \a offset is in.
	int32 IndexAt(int32 offset) const;
	const TextStyle& At(int32 offset) const { return fRuns[IndexAt(offset)].style; }
	bool IsOneStyle() const { return fRuns.size() == 1; }

	/// One style for all.
	void SetAll(const TextStyle& style);
	/// The bytes that are put in take this style. Only so does the text that it knows of grow.
	void Insert(int32 offset, int32 length, const TextStyle& style);
	void Remove(int32 from, int32 to);
	void Set(int32 from, int32 to, const TextStyle& style);
	void Apply(int32 from, int32 to, const BFont* font, uint32 mask, const rgb_color* color);
	/// Those of a range in place of what it has; runs that go back or lie beyond it are left out. What
	/// comes before the first one takes its style, too.
	void SetRuns(int32 from, int32 to, const text_run_array& runs);

private:
	int32 SplitAt(int32 offset);
	void Join();

	std::vector<Run> fRuns;
	int32 fLength;
};


struct RunArrayDeleter {
	void operator()(text_run_array* runs) const { BTextView::FreeRunArray(runs); }
};

/// The styles of a range, their offsets counted from its start; never empty.
RunArray CopyRuns(const TextStyles& styles, int32 from, int32 to);
/// Those of a text of so many bytes, and of another one behind it. Null when there is no memory.
RunArray JoinRuns(const text_run_array& first, int32 firstLength, const text_run_array& second);

/// The run array in \a size bytes of outside data; null when they are none.
RunArray ReadFlatRuns(const void* data, ssize_t size);
/// How many bytes a flattened array of so many runs has.
size_t FlatRunsSize(int32 count);

} // namespace BPrivate

#endif // KITS_INTERFACE_TEXT_STYLES_H
