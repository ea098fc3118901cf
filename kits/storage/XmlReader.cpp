// SPDX-License-Identifier: MIT
// Reads the little of XML that packages of the MIME database use.

#include "storage/XmlReader.h"

#include <algorithm>

#include <stdlib.h>
#include <string.h>

namespace BPrivate {

namespace {

const char* const kBlanks = " \t\r\n";


void
AppendUtf8(unsigned long code, std::string* text)
{
	if (code == 0 || code > 0x10ffff)
		return;
	if (code < 0x80) {
		*text += (char)code;
	} else if (code < 0x800) {
		*text += (char)(0xc0 | code >> 6);
		*text += (char)(0x80 | (code & 0x3f));
	} else if (code < 0x10000) {
		*text += (char)(0xe0 | code >> 12);
		*text += (char)(0x80 | (code >> 6 & 0x3f));
		*text += (char)(0x80 | (code & 0x3f));
	} else {
		*text += (char)(0xf0 | code >> 18);
		*text += (char)(0x80 | (code >> 12 & 0x3f));
		*text += (char)(0x80 | (code >> 6 & 0x3f));
		*text += (char)(0x80 | (code & 0x3f));
	}
}


void
AppendReference(const std::string& name, std::string* text)
{
	if (name == "amp")
		*text += '&';
	else if (name == "lt")
		*text += '<';
	else if (name == "gt")
		*text += '>';
	else if (name == "quot")
		*text += '"';
	else if (name == "apos")
		*text += '\'';
	else if (name.size() > 1 && name[0] == '#')
		AppendUtf8(name[1] == 'x' ? strtoul(name.c_str() + 2, nullptr, 16)
								  : strtoul(name.c_str() + 1, nullptr, 10),
			text);
}


std::string
Unescape(std::string_view raw)
{
	std::string text;
	while (true) {
		const size_t start = raw.find('&');
		const size_t end = start == std::string_view::npos ? start : raw.find(';', start);
		if (end == std::string_view::npos)
			return text.append(raw);
		text.append(raw.substr(0, start));
		AppendReference(std::string(raw.substr(start + 1, end - start - 1)), &text);
		raw.remove_prefix(end + 1);
	}
}

} // namespace


XmlReader::XmlReader(std::string_view document)
	: fRest(document),
	  fIsCharacterData(false),
	  fClosesItself(false)
{
}


XmlReader::event
XmlReader::Next()
{
	if (fClosesItself) {
		fClosesItself = false;
		return kEnd;
	}
	while (!fRest.empty()) {
		if (fRest[0] != '<') {
			const size_t length = fRest.find('<');
			fText = fRest.substr(0, length);
			fIsCharacterData = false;
			fRest.remove_prefix(length == std::string_view::npos ? fRest.size() : length);
			return kText;
		}
		if (fRest.starts_with("<!--")) {
			if (!SkipPast("-->"))
				return kDamaged;
		} else if (fRest.starts_with("<![CDATA[")) {
			const size_t end = fRest.find("]]>");
			if (end == std::string_view::npos)
				return kDamaged;
			fText = fRest.substr(9, end - 9);
			fIsCharacterData = true;
			fRest.remove_prefix(end + 3);
			return kText;
		} else if (fRest.starts_with("<?")) {
			if (!SkipPast("?>"))
				return kDamaged;
		} else if (fRest.starts_with("<!")) {
			if (!SkipDocumentType())
				return kDamaged;
		} else {
			return ReadTag();
		}
	}
	return kEndOfDocument;
}


std::string
XmlReader::Text() const
{
	return fIsCharacterData ? std::string(fText) : Unescape(fText);
}


std::optional<std::string>
XmlReader::Attribute(std::string_view name) const
{
	const std::string_view* value = FindAttribute(name);
	return value == nullptr ? std::nullopt : std::optional(Unescape(*value));
}


XmlReader::event
XmlReader::ReadTag()
{
	fRest.remove_prefix(1);
	const bool isEnd = fRest.starts_with("/");
	if (isEnd)
		fRest.remove_prefix(1);
	fName = ReadName();
	if (fName.empty() || !ReadAttributes())
		return kDamaged;

	fClosesItself = fRest.starts_with("/");
	if (fClosesItself)
		fRest.remove_prefix(1);
	if (!fRest.starts_with(">") || (isEnd && fClosesItself))
		return kDamaged;
	fRest.remove_prefix(1);
	return isEnd ? kEnd : kStart;
}


bool
XmlReader::SkipPast(const char* end)
{
	const size_t found = fRest.find(end);
	if (found == std::string_view::npos)
		return false;
	fRest.remove_prefix(found + strlen(end));
	return true;
}


bool
XmlReader::SkipDocumentType()
{
	const size_t end = fRest.find('>');
	const size_t subset = fRest.find('[');
	if (subset == std::string_view::npos || end < subset)
		return SkipPast(">");
	return SkipPast("]") && SkipPast(">");
}


void
XmlReader::SkipBlanks()
{
	const size_t blanks = fRest.find_first_not_of(kBlanks);
	fRest.remove_prefix(blanks == std::string_view::npos ? fRest.size() : blanks);
}


std::string_view
XmlReader::ReadName()
{
	const std::string_view name = fRest.substr(0, fRest.find_first_of(" \t\r\n=/><\"'"));
	fRest.remove_prefix(name.size());
	return name;
}


bool
XmlReader::ReadAttributes()
{
	fAttributes.clear();
	SkipBlanks();
	while (!fRest.empty() && fRest[0] != '>' && fRest[0] != '/') {
		const std::string_view name = ReadName();
		SkipBlanks();
		if (name.empty() || !fRest.starts_with("="))
			return false;
		fRest.remove_prefix(1);
		SkipBlanks();
		if (fRest.empty() || (fRest[0] != '"' && fRest[0] != '\''))
			return false;
		const size_t end = fRest.find(fRest[0], 1);
		if (end == std::string_view::npos)
			return false;
		fAttributes.emplace_back(name, fRest.substr(1, end - 1));
		fRest.remove_prefix(end + 1);
		SkipBlanks();
	}
	return !fRest.empty();
}


const std::string_view*
XmlReader::FindAttribute(std::string_view name) const
{
	// The last one counts.
	const auto found = std::find_if(fAttributes.rbegin(), fAttributes.rend(),
		[name](const auto& attribute) { return attribute.first == name; });
	return found == fAttributes.rend() ? nullptr : &found->second;
}


std::string
xml_escape(const std::string& text)
{
	std::string escaped;
	for (char c : text) {
		switch (c) {
			case '&':
				escaped += "&amp;";
				break;
			case '<':
				escaped += "&lt;";
				break;
			case '>':
				escaped += "&gt;";
				break;
			case '"':
				escaped += "&quot;";
				break;
			case '\'':
				escaped += "&apos;";
				break;
			default:
				escaped += c;
				break;
		}
	}
	return escaped;
}


bool
is_xml_text(const char* text)
{
	const unsigned char* bytes = (const unsigned char*)text;
	while (*bytes != 0) {
		const unsigned char lead = *bytes++;
		if (lead < 0x20 && strchr(kBlanks, lead) == nullptr)
			return false;
		if (lead < 0x80)
			continue;
		if (lead < 0xc2 || lead > 0xf4)
			return false;
		for (int more = lead >= 0xf0 ? 3 : lead >= 0xe0 ? 2 : 1; more > 0; more--) {
			if ((*bytes++ & 0xc0) != 0x80)
				return false;
		}
	}
	return true;
}

} // namespace BPrivate
