// SPDX-License-Identifier: MIT
// The difference of two texts as a patch.

#include "codegen/UnifiedDiff.h"

#include <algorithm>
#include <unordered_map>
#include <vector>

namespace {

constexpr size_t kContextLines = 3;

/// Texts that differ in more lines are not searched for what they share: it would take too long.
constexpr int kMostEdits = 2000;

/// One line of the difference: kept, taken out of the old text, or put in from the new.
struct edit {
	char sign; // ' ', '-', '+'
	int oldLine;
	int newLine;
};

/// The lines of a text, each with its line break, and the same lines as numbers, equal for equal lines.
struct numbered_lines {
	std::vector<std::string_view> text;
	std::vector<int> number;
};

typedef std::unordered_map<std::string_view, int> line_numbers;


numbered_lines
SplitLines(std::string_view text, line_numbers& numbers)
{
	numbered_lines lines;
	while (!text.empty()) {
		const size_t end = text.find('\n');
		const std::string_view line =
			text.substr(0, end == std::string_view::npos ? text.length() : end + 1);
		lines.text.push_back(line);
		lines.number.push_back(
			numbers.emplace(line, static_cast<int>(numbers.size())).first->second);
		text.remove_prefix(line.length());
	}
	return lines;
}


/// Finds the fewest edits that turn a range of old lines into a range of new ones, after E. Myers,
/// "An O(ND) Difference Algorithm and Its Variations".
class ShortestEdit {
public:
	ShortestEdit(const int* oldLines, int oldCount, const int* newLines, int newCount)
		: fOld(oldLines),
		  fOldCount(oldCount),
		  fNew(newLines),
		  fNewCount(newCount)
	{
	}

	/// Appends the edits; the line numbers in them begin at \a oldStart and \a newStart.
	void AppendEdits(int oldStart, int newStart, std::vector<edit>& edits)
	{
		const bool found = Search();
		std::vector<edit> backward;
		int x = fOldCount;
		int y = fNewCount;
		if (found)
			WalkBack(&x, &y, backward);
		while (y > 0)
			backward.push_back({'+', x, --y});
		while (x > 0)
			backward.push_back({'-', --x, 0});
		for (auto step = backward.rbegin(); step != backward.rend(); ++step)
			edits.push_back({step->sign, step->oldLine + oldStart, step->newLine + newStart});
	}

private:
	/// Notes, for 0, 1, 2... edits, how far each diagonal gets; false when it takes too many.
	bool Search()
	{
		std::vector<int> reach(2 * kMostEdits + 3, 0);
		int* const at = reach.data() + kMostEdits + 1;
		for (int edits = 0; edits <= kMostEdits; edits++) {
			fTrace.emplace_back(at - edits - 1, at + edits + 2);
			for (int k = -edits; k <= edits; k += 2) {
				const bool down = k == -edits || (k != edits && at[k - 1] < at[k + 1]);
				int x = down ? at[k + 1] : at[k - 1] + 1;
				int y = x - k;
				while (x < fOldCount && y < fNewCount && fOld[x] == fNew[y]) {
					x++;
					y++;
				}
				at[k] = x;
				if (x >= fOldCount && y >= fNewCount)
					return true;
			}
		}
		return false;
	}

	void WalkBack(int* endX, int* endY, std::vector<edit>& backward) const
	{
		int x = *endX;
		int y = *endY;
		for (int edits = static_cast<int>(fTrace.size()) - 1; edits > 0; edits--) {
			const int* const at = fTrace[edits].data() + edits + 1;
			const int k = x - y;
			const bool down = k == -edits || (k != edits && at[k - 1] < at[k + 1]);
			// Where the edit had led to, before the equal lines behind it.
			const int start = down ? at[k + 1] : at[k - 1] + 1;
			while (x > start)
				backward.push_back({' ', --x, --y});
			if (down)
				backward.push_back({'+', x, --y});
			else
				backward.push_back({'-', --x, y});
		}
		while (x > 0 && y > 0)
			backward.push_back({' ', --x, --y});
		*endX = x;
		*endY = y;
	}

	const int* fOld;
	int fOldCount;
	const int* fNew;
	int fNewCount;
	std::vector<std::vector<int>> fTrace;
};


std::vector<edit>
FindEdits(const numbered_lines& oldLines, const numbered_lines& newLines)
{
	const int oldCount = static_cast<int>(oldLines.number.size());
	const int newCount = static_cast<int>(newLines.number.size());
	int head = 0;
	while (head < oldCount && head < newCount && oldLines.number[head] == newLines.number[head])
		head++;
	int tail = 0;
	while (tail < oldCount - head && tail < newCount - head
		&& oldLines.number[oldCount - 1 - tail] == newLines.number[newCount - 1 - tail])
		tail++;

	std::vector<edit> edits;
	for (int i = 0; i < head; i++)
		edits.push_back({' ', i, i});
	ShortestEdit middle(oldLines.number.data() + head, oldCount - head - tail,
		newLines.number.data() + head, newCount - head - tail);
	middle.AppendEdits(head, head, edits);
	for (int i = tail; i > 0; i--)
		edits.push_back({' ', oldCount - i, newCount - i});
	return edits;
}


std::string
RangeText(int start, int count)
{
	// A range without lines names the line before it.
	std::string text = std::to_string(count == 0 ? start : start + 1);
	if (count != 1)
		text += "," + std::to_string(count);
	return text;
}


void
AppendHunk(const std::vector<edit>& edits, size_t from, size_t to, const numbered_lines& oldLines,
	const numbered_lines& newLines, std::string& diff)
{
	int oldCount = 0;
	int newCount = 0;
	for (size_t i = from; i < to; i++) {
		oldCount += edits[i].sign != '+';
		newCount += edits[i].sign != '-';
	}
	diff += "@@ -" + RangeText(edits[from].oldLine, oldCount) + " +"
		+ RangeText(edits[from].newLine, newCount) + " @@\n";
	for (size_t i = from; i < to; i++) {
		const std::string_view line = edits[i].sign == '+' ? newLines.text[edits[i].newLine]
														   : oldLines.text[edits[i].oldLine];
		diff += edits[i].sign;
		diff += line;
		if (line.back() != '\n')
			diff += "\n\\ No newline at end of file\n";
	}
}

} // namespace


std::string
UnifiedDiff(const std::string& oldName, const std::string& newName, std::string_view oldText,
	std::string_view newText)
{
	line_numbers numbers;
	const numbered_lines oldLines = SplitLines(oldText, numbers);
	const numbered_lines newLines = SplitLines(newText, numbers);
	const std::vector<edit> edits = FindEdits(oldLines, newLines);

	std::string diff;
	size_t at = 0;
	const auto isChange = [](const edit& e) { return e.sign != ' '; };
	for (;;) {
		const size_t first =
			std::find_if(edits.begin() + at, edits.end(), isChange) - edits.begin();
		if (first == edits.size())
			return diff;

		// A hunk goes on as long as the next change is near enough for the contexts to touch.
		size_t last = first;
		for (size_t i = first; i < edits.size() && i <= last + 2 * kContextLines + 1; i++) {
			if (isChange(edits[i]))
				last = i;
		}
		if (diff.empty())
			diff = "--- " + oldName + "\n+++ " + newName + "\n";
		const size_t from = first - std::min<size_t>(first - at, kContextLines);
		const size_t to = std::min(edits.size(), last + kContextLines + 1);
		AppendHunk(edits, from, to, oldLines, newLines, diff);
		at = to;
	}
}
