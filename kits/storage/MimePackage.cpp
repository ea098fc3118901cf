// SPDX-License-Identifier: MIT
// What a package of the shared MIME database tells about types.
//
// The format is that of the freedesktop.org shared MIME database; what it has no element for is in
// elements of a name space of the kit's own, which the database passes on unread.

#include "storage/MimePackage.h"

#include <algorithm>
#include <cctype>

#include <fnmatch.h>
#include <stdlib.h>
#include <string.h>

#include <Errors.h>

#include "storage/XmlReader.h"

namespace BPrivate {

namespace {

// Matches nested deeper than this are left out.
const int kMaxNesting = 16;


// The bytes of a value of type "string", which may have C's escapes.
std::string
UnescapeBytes(const std::string& text)
{
	std::string bytes;
	for (size_t i = 0; i < text.size(); i++) {
		if (text[i] != '\\' || i + 1 == text.size()) {
			bytes += text[i];
			continue;
		}
		const char c = text[++i];
		if (c == 'x' && i + 1 < text.size() && isxdigit((unsigned char)text[i + 1])) {
			const std::string digits = text.substr(i + 1, 2);
			char* end;
			bytes += (char)strtoul(digits.c_str(), &end, 16);
			i += end - digits.c_str();
		} else if (c >= '0' && c <= '7') {
			const std::string digits = text.substr(i, 3);
			char* end;
			bytes += (char)strtoul(digits.c_str(), &end, 8);
			i += end - digits.c_str() - 1;
		} else {
			const char* const names = "nrtbfva";
			const char* const found = strchr(names, c);
			bytes += found == nullptr ? c : "\n\r\t\b\f\v\a"[found - names];
		}
	}
	return bytes;
}


std::string
HexBytes(const std::string& text)
{
	std::string bytes;
	for (size_t i = text.compare(0, 2, "0x") == 0 ? 2 : 0; i + 1 < text.size(); i += 2)
		bytes += (char)strtoul(text.substr(i, 2).c_str(), nullptr, 16);
	return bytes;
}


// The bytes of a number in the order that the kind of match wants; empty for an unknown kind.
std::string
NumberBytes(const std::string& kind, const std::string& text)
{
	const unsigned long number = strtoul(text.c_str(), nullptr, 0);
	const int size = kind == "byte" ? 1 : kind.ends_with("16") ? 2 : kind.ends_with("32") ? 4 : 0;
	std::string bytes;
	for (int i = 0; i < size; i++)
		bytes += (char)(number >> 8 * i);

	const uint16 one = 1;
	const bool hostIsBig = *(const uint8*)&one == 0;
	if (kind.starts_with("big") || (kind.starts_with("host") && hostIsBig))
		std::reverse(bytes.begin(), bytes.end());
	return bytes;
}


mime_match
ReadMatch(const XmlReader& reader)
{
	mime_match match;
	const std::optional<std::string> kind = reader.Attribute("type");
	const std::optional<std::string> value = reader.Attribute("value");
	const std::optional<std::string> offset = reader.Attribute("offset");
	const std::optional<std::string> mask = reader.Attribute("mask");
	if (!kind.has_value() || !value.has_value() || !offset.has_value())
		return match;

	const bool isString = *kind == "string";
	match.value = isString ? UnescapeBytes(*value) : NumberBytes(*kind, *value);
	if (mask.has_value())
		match.mask = isString ? HexBytes(*mask) : NumberBytes(*kind, *mask);
	if (!match.mask.empty() && match.mask.size() != match.value.size())
		match.value.clear();

	char* end;
	match.from = strtoul(offset->c_str(), &end, 10);
	match.to = *end == ':' ? strtoul(end + 1, nullptr, 10) : match.from;
	return match;
}


/// Takes what a package tells from the events of its document.
class PackageReader {
public:
	PackageReader(std::string_view document, std::vector<mime_description>* types)
		: fReader(document),
		  fTypes(types)
	{
	}

	status_t Read()
	{
		while (true) {
			switch (fReader.Next()) {
				case XmlReader::kStart:
					if (fReader.Name() == "mime-type" || fReader.Name() == "be:supertype") {
						if (!ReadType())
							return B_BAD_DATA;
					}
					break;
				case XmlReader::kEndOfDocument:
					return B_OK;
				case XmlReader::kDamaged:
					return B_BAD_DATA;
				default:
					break;
			}
		}
	}

private:
	bool ReadType()
	{
		const std::string_view element = fReader.Name();
		mime_description type;
		const std::optional<std::string> name = fReader.Attribute("type");
		if (name.has_value())
			type.type = *name;

		while (true) {
			switch (fReader.Next()) {
				case XmlReader::kStart:
					if (!ReadElement(&type))
						return false;
					break;
				case XmlReader::kEnd:
					if (fReader.Name() != element)
						break;
					if (!type.type.empty())
						fTypes->push_back(std::move(type));
					return true;
				case XmlReader::kText:
					break;
				default:
					return false;
			}
		}
	}

	bool ReadElement(mime_description* type)
	{
		const std::string_view element = fReader.Name();
		if (element == "comment" && !fReader.HasAttribute("xml:lang"))
			return ReadText(&type->comment);
		if (element == "be:long-description")
			return ReadText(&type->longDescription);
		if (element == "be:preferred-app")
			return ReadText(&type->preferredApp);
		if (element == "magic")
			return ReadMagic(type);

		if (element == "glob")
			ReadGlob(type);
		else if (element == "glob-deleteall")
			type->replacesGlobs = true;
		else if (element == "magic-deleteall")
			type->replacesMagics = true;
		return true;
	}

	bool ReadText(std::string* text)
	{
		text->clear();
		while (true) {
			switch (fReader.Next()) {
				case XmlReader::kText:
					*text += fReader.Text();
					break;
				case XmlReader::kEnd:
					return true;
				default:
					return false;
			}
		}
	}

	void ReadGlob(mime_description* type)
	{
		const std::optional<std::string> pattern = fReader.Attribute("pattern");
		if (!pattern.has_value() || pattern->empty())
			return;
		mime_glob glob;
		glob.pattern = *pattern;
		const std::optional<std::string> weight = fReader.Attribute("weight");
		if (weight.has_value())
			glob.weight = atoi(weight->c_str());
		const std::optional<std::string> isCaseSensitive = fReader.Attribute("case-sensitive");
		glob.isCaseSensitive = isCaseSensitive.has_value() && *isCaseSensitive == "true";
		type->globs.push_back(glob);
	}

	bool ReadMagic(mime_description* type)
	{
		mime_magic magic;
		const std::optional<std::string> priority = fReader.Attribute("priority");
		if (priority.has_value())
			magic.priority = atoi(priority->c_str());
		if (!ReadMatches(&magic.matches, "magic", 0))
			return false;
		type->magics.push_back(std::move(magic));
		return true;
	}

	bool ReadMatches(std::vector<mime_match>* matches, const char* element, int depth)
	{
		if (depth > kMaxNesting)
			return false;
		while (true) {
			switch (fReader.Next()) {
				case XmlReader::kStart:
				{
					if (fReader.Name() != "match")
						return false;
					mime_match match = ReadMatch(fReader);
					if (!ReadMatches(&match.nested, "match", depth + 1))
						return false;
					matches->push_back(std::move(match));
					break;
				}
				case XmlReader::kEnd:
					return fReader.Name() == element;
				case XmlReader::kText:
					break;
				default:
					return false;
			}
		}
	}

	XmlReader fReader;
	std::vector<mime_description>* fTypes;
};


std::string
Element(const char* name, const std::string& text)
{
	if (text.empty())
		return "";
	return std::string("    <") + name + ">" + xml_escape(text) + "</" + name + ">\n";
}

} // namespace


bool
mime_match::Holds(std::string_view content) const
{
	if (value.empty() || content.size() < value.size())
		return false;

	bool isThere = false;
	const size_t last = std::min<size_t>(to, content.size() - value.size());
	for (size_t offset = from; offset <= last && !isThere; offset++) {
		isThere = true;
		for (size_t i = 0; i < value.size() && isThere; i++) {
			const char bits = mask.empty() ? (char)0xff : mask[i];
			isThere = (content[offset + i] & bits) == (value[i] & bits);
		}
	}
	if (!isThere || nested.empty())
		return isThere;
	return std::any_of(nested.begin(), nested.end(),
		[content](const mime_match& match) { return match.Holds(content); });
}


bool
mime_magic::Holds(std::string_view content) const
{
	return std::any_of(matches.begin(), matches.end(),
		[content](const mime_match& match) { return match.Holds(content); });
}


bool
mime_glob::Holds(const std::string& name) const
{
	// Hundreds of patterns are asked about each name: most differ in the last letter already.
	if (pattern.empty())
		return name.empty();
	const unsigned char last = pattern.back();
	const bool isLetter = last < 0x80 && strchr("*?]", last) == nullptr;
	if (isLetter
		&& (name.empty() || tolower(last) != tolower(static_cast<unsigned char>(name.back()))))
		return false;

	const std::string_view rest = std::string_view(pattern).substr(pattern[0] == '*' ? 1 : 0);
	if (rest.find_first_of("*?[") != std::string_view::npos)
		return fnmatch(pattern.c_str(), name.c_str(), isCaseSensitive ? 0 : FNM_CASEFOLD) == 0;

	if (name.size() < rest.size() || (pattern[0] != '*' && name.size() != rest.size()))
		return false;
	const char* end = name.c_str() + (name.size() - rest.size());
	return (isCaseSensitive ? strcmp(end, rest.data()) : strcasecmp(end, rest.data())) == 0;
}


status_t
read_mime_package(std::string_view document, std::vector<mime_description>* types)
{
	return PackageReader(document, types).Read();
}


std::string
write_mime_package(const mime_description& type)
{
	const bool isSupertype = type.type.find('/') == std::string::npos;
	const char* const element = isSupertype ? "be:supertype" : "mime-type";
	std::string document =
		"<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n"
		"<mime-info xmlns=\"http://www.freedesktop.org/standards/shared-mime-info\""
		" xmlns:be=\"urn:x-be-api:mime\">\n";
	document += std::string("  <") + element + " type=\"" + xml_escape(type.type) + "\">\n";
	document += Element("comment", type.comment);
	if (type.replacesGlobs)
		document += "    <glob-deleteall/>\n";
	for (const mime_glob& glob : type.globs)
		document += "    <glob pattern=\"" + xml_escape(glob.pattern) + "\"/>\n";
	document += Element("be:long-description", type.longDescription);
	document += Element("be:preferred-app", type.preferredApp);
	document += std::string("  </") + element + ">\n</mime-info>\n";
	return document;
}


std::string
mime_key(std::string_view type)
{
	std::string key(type);
	for (char& c : key) {
		if (c >= 'A' && c <= 'Z')
			c += 'a' - 'A';
	}
	return key;
}

} // namespace BPrivate
