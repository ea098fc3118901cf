// SPDX-License-Identifier: MIT
// Short texts that were measured or drawn lately.
#include "display/qt/TextRuns.h"

#include <cstdlib>
#include <cstring>

namespace BPrivate {

namespace {

// Enough for a screen full of labels.
const size_t kMostKilobytes = 2048;
// What a run takes besides its text and pixels: nodes, pointers, the allocator's.
const size_t kBytesOfRun = 256;


// What the user allows, or else what is enough.
size_t
MostBytes()
{
	const char* setting = getenv("BE_TEXT_CACHE");
	const size_t kilobytes = setting != nullptr ? strtoul(setting, nullptr, 10) : 0;
	return (kilobytes > 0 && kilobytes < kMostKilobytes ? kilobytes : kMostKilobytes) * 1024;
}

} // namespace


/// The font's values and the text in one row of bytes.
class TextRuns::Key {
public:
	Key(const FontKey& font, const char* text, int32 length)
		: fSize(0)
	{
		Add(&font.family, sizeof(font.family));
		Add(&font.style, sizeof(font.style));
		Add(&font.size, sizeof(font.size));
		Add(&font.shear, sizeof(font.shear));
		Add(&font.rotation, sizeof(font.rotation));
		Add(&font.spacing, sizeof(font.spacing));
		Add(&font.face, sizeof(font.face));
		Add(&font.flags, sizeof(font.flags));
		Add(text, static_cast<size_t>(length));
	}

	operator std::string_view() const { return std::string_view(fBytes, fSize); }

private:
	void Add(const void* bytes, size_t size)
	{
		memcpy(fBytes + fSize, bytes, size);
		fSize += size;
	}

	char fBytes[sizeof(FontKey) + kLongest];
	size_t fSize;
};


TextRuns::TextRuns()
	: fMostBytes(MostBytes())
{
}


std::shared_ptr<const TextRun>
TextRuns::Find(const FontKey& font, const char* text, int32 length)
{
	const Key key(font, text, length);
	std::lock_guard<std::mutex> lock(fMutex);
	auto found = fYoung.find(std::string_view(key));
	if (found != fYoung.end())
		return found->second;
	found = fOld.find(std::string_view(key));
	if (found == fOld.end())
		return nullptr;
	std::shared_ptr<const TextRun> run = found->second;
	fOld.erase(found);
	Insert(key, run);
	return run;
}


void
TextRuns::Keep(
	const FontKey& font, const char* text, int32 length, std::shared_ptr<const TextRun> run)
{
	const Key key(font, text, length);
	std::lock_guard<std::mutex> lock(fMutex);
	Insert(key, std::move(run));
}


void
TextRuns::Insert(std::string_view key, std::shared_ptr<const TextRun> run)
{
	fYoungBytes += key.size() + run->coverage.capacity() + kBytesOfRun;
	fYoung.insert_or_assign(std::string(key), std::move(run));
	if (fYoungBytes < fMostBytes / 2)
		return;
	fOld.swap(fYoung);
	fYoung.clear();
	fYoungBytes = 0;
}

} // namespace BPrivate
