// SPDX-License-Identifier: MIT
// Names, sizes and times of files as a file panel shows and orders them.

#include "interface/panel/PanelText.h"

#include <cinttypes>
#include <cstdio>
#include <cwctype>

#include <locale.h>

#include <Errors.h>

namespace BPrivate {

namespace {

const char32_t kReplacement = 0xfffd;
const char* const kReplacementText = "\xef\xbf\xbd";


/// The character at \a position, which moves behind it; kReplacement, one byte on, where none is.
/// \a valid becomes false for what is no UTF-8.
char32_t
NextCharacter(const std::string& text, size_t* position, bool* valid)
{
	const unsigned char lead = text[(*position)++];
	if (lead < 0x80)
		return lead;

	const int more = lead >= 0xf0 ? 3 : lead >= 0xe0 ? 2 : 1;
	if (lead < 0xc2 || lead > 0xf4 || *position + more > text.size()) {
		*valid = false;
		return kReplacement;
	}
	char32_t character = lead & (0x3f >> more);
	for (int i = 0; i < more; i++) {
		const unsigned char next = text[*position + i];
		if ((next & 0xc0) != 0x80) {
			*valid = false;
			return kReplacement;
		}
		character = character << 6 | (next & 0x3f);
	}
	const char32_t kSmallest[] = {0, 0x80, 0x800, 0x10000};
	const bool isSurrogate = character >= 0xd800 && character <= 0xdfff;
	if (character < kSmallest[more] || character > 0x10ffff || isSurrogate) {
		*valid = false;
		return kReplacement;
	}
	*position += more;
	return character;
}


char32_t
Folded(char32_t character)
{
	// The program's own locale may know ASCII only.
	static const locale_t sLocale = newlocale(LC_CTYPE_MASK, "C.UTF-8", nullptr);
	if (character < 0x80)
		return character >= 'A' && character <= 'Z' ? character - 'A' + 'a' : character;
	return sLocale != nullptr ? towlower_l(character, sLocale) : character;
}


std::u32string
FoldedText(const std::string& text)
{
	std::u32string folded;
	bool valid = true;
	for (size_t i = 0; i < text.size();)
		folded += Folded(NextCharacter(text, &i, &valid));
	return folded;
}


bool
IsDigit(char32_t character)
{
	return character >= '0' && character <= '9';
}


/// Compares the numbers at both places by value and moves behind them.
int
CompareNumbers(const std::u32string& a, size_t* atA, const std::u32string& b, size_t* atB)
{
	const auto skipZeros = [](const std::u32string& text, size_t* at) {
		while (*at < text.size() && text[*at] == '0')
			(*at)++;
	};
	const auto end = [](const std::u32string& text, size_t at) {
		while (at < text.size() && IsDigit(text[at]))
			at++;
		return at;
	};
	skipZeros(a, atA);
	skipZeros(b, atB);
	const size_t endA = end(a, *atA);
	const size_t endB = end(b, *atB);
	const size_t digitsA = endA - *atA;
	const size_t digitsB = endB - *atB;
	const int order = digitsA != digitsB ? (digitsA < digitsB ? -1 : 1)
										 : a.compare(*atA, digitsA, b, *atB, digitsB);
	*atA = endA;
	*atB = endB;
	return order;
}


int
CompareFolded(const std::u32string& a, const std::u32string& b)
{
	size_t atA = 0;
	size_t atB = 0;
	while (atA < a.size() && atB < b.size()) {
		if (IsDigit(a[atA]) && IsDigit(b[atB])) {
			const int order = CompareNumbers(a, &atA, b, &atB);
			if (order != 0)
				return order;
			continue;
		}
		if (a[atA] != b[atB])
			return a[atA] < b[atB] ? -1 : 1;
		atA++;
		atB++;
	}
	return (atA < a.size()) - (atB < b.size());
}

} // namespace


bool
IsValidText(const std::string& text)
{
	bool valid = true;
	for (size_t i = 0; i < text.size() && valid;)
		NextCharacter(text, &i, &valid);
	return valid;
}


std::string
DisplayName(const std::string& name)
{
	std::string shown;
	for (size_t i = 0; i < name.size();) {
		const size_t start = i;
		bool valid = true;
		const char32_t character = NextCharacter(name, &i, &valid);
		if (!valid || character < 0x20 || (character >= 0x7f && character < 0xa0))
			shown += kReplacementText;
		else
			shown.append(name, start, i - start);
	}
	return shown;
}


NameKey::NameKey(const std::string& name)
	: folded(FoldedText(name)),
	  name(name)
{
}


bool
NameKey::operator<(const NameKey& other) const
{
	const int order = CompareFolded(folded, other.folded);
	return order != 0 ? order < 0 : name < other.name;
}


bool
BeginsWith(const std::string& name, const std::string& prefix)
{
	return FoldedText(name).starts_with(FoldedText(prefix));
}


std::string
SizeText(off_t size)
{
	char text[40];
	if (size < 1024) {
		snprintf(text, sizeof(text), size == 1 ? "%" PRId64 " byte" : "%" PRId64 " bytes",
			static_cast<int64>(size));
		return text;
	}
	const char* const kUnits[] = {"KiB", "MiB", "GiB", "TiB", "PiB", "EiB"};
	double value = static_cast<double>(size) / 1024;
	size_t unit = 0;
	// What would be shown as 1024.0 is one of the next unit.
	while (value >= 1023.95 && unit + 1 < sizeof(kUnits) / sizeof(kUnits[0])) {
		value /= 1024;
		unit++;
	}
	snprintf(text, sizeof(text), "%.1f %s", value, kUnits[unit]);
	return text;
}


std::string
TimeText(time_t time)
{
	struct tm local;
	char text[64];
	if (localtime_r(&time, &local) == nullptr
		|| strftime(text, sizeof(text), "%Y-%m-%d %H:%M", &local) == 0)
		return "";
	return text;
}


std::string
StatusSentence(status_t status)
{
	const struct {
		status_t status;
		const char* sentence;
	} kSentences[] = {
		{B_PERMISSION_DENIED, "Permission denied."},
		{B_NOT_ALLOWED, "This is not allowed."},
		{B_ENTRY_NOT_FOUND, "It does not exist."},
		{B_NOT_A_DIRECTORY, "It is no folder."},
		{B_FILE_EXISTS, "Something with this name is there already."},
		{B_NAME_TOO_LONG, "The name is too long."},
		{B_DEVICE_FULL, "The disk is full."},
		{B_READ_ONLY_DEVICE, "The disk cannot be written to."},
		{B_LINK_LIMIT, "Its links lead in a circle."},
		{B_IO_ERROR, "The disk could not be read or written."},
		{B_NO_MORE_FDS, "Too many files are open."},
		{B_NO_MEMORY, "There is not enough memory."},
	};
	for (const auto& known : kSentences) {
		if (known.status == status)
			return known.sentence;
	}
	char text[40];
	snprintf(text, sizeof(text), "Error 0x%08" PRIx32 ".", static_cast<uint32>(status));
	return text;
}

} // namespace BPrivate
