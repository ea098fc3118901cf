// SPDX-License-Identifier: MIT
// Short texts that were measured or drawn lately.
#ifndef DISPLAY_QT_TEXT_RUNS_H
#define DISPLAY_QT_TEXT_RUNS_H

#include <functional>
#include <memory>
#include <mutex>
#include <string>
#include <string_view>
#include <unordered_map>
#include <vector>

#include <QRect>

#include "display/FontEngine.h"

namespace BPrivate {

/// How wide a text is, and the pixels that it covers.
struct TextRun {
	float width = 0;

	/// The pixels are those of this scale, for a baseline that starts so far right of and below a pixel's
	/// left-top corner (device pixels). A scale of 0: there are none.
	float scale = 0;
	double x = 0;
	double y = 0;
	/// Device pixels from that pixel on: as many as the ink needs.
	QRect area;
	std::vector<uint8> coverage;
};


/// Labels are drawn again and again: what Qt makes of them is kept, up to a limit. What was not asked for in a
/// long time goes. Any thread.
class TextRuns {
public:
	/// Takes as much memory as BE_TEXT_CACHE says, in kB, and 2 MB at most.
	TextRuns();

	/// Whether runs of this length, in bytes, are kept.
	static bool IsKept(int32 length) { return length > 0 && length <= kLongest; }

	/// Null when it is not there.
	std::shared_ptr<const TextRun> Find(const FontKey& font, const char* text, int32 length);
	/// Replaces what was known of the text.
	void Keep(
		const FontKey& font, const char* text, int32 length, std::shared_ptr<const TextRun> run);

private:
	static const int32 kLongest = 64;

	struct Hash : std::hash<std::string_view> {
		typedef void is_transparent;
	};
	typedef std::unordered_map<std::string, std::shared_ptr<const TextRun>, Hash, std::equal_to<>>
		RunMap;

	class Key;

	void Insert(std::string_view key, std::shared_ptr<const TextRun> run);

	const size_t fMostBytes;
	std::mutex fMutex;
	// When the young ones take half of the room, they become the old ones, and the old ones go.
	RunMap fYoung;
	RunMap fOld;
	size_t fYoungBytes = 0;
};

} // namespace BPrivate

#endif // DISPLAY_QT_TEXT_RUNS_H
