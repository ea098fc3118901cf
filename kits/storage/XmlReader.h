// SPDX-License-Identifier: MIT
// Reads the little of XML that packages of the MIME database use.

#ifndef _XML_READER_H
#define _XML_READER_H

#include <optional>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

namespace BPrivate {

/// Walks a document from tag to tag. Names keep their prefix; comments, processing instructions and
/// the document type are passed over. The document is not trusted: it must outlive the reader.
class XmlReader {
public:
	enum event { kStart, kEnd, kText, kEndOfDocument, kDamaged };

	explicit XmlReader(std::string_view document);

	/// The next event. A tag that closes itself gives kStart and kEnd.
	event Next();

	/// Of a start or end tag.
	std::string_view Name() const { return fName; }
	/// Of a text, references resolved.
	std::string Text() const;
	/// Of a start tag, references resolved; none when absent.
	std::optional<std::string> Attribute(std::string_view name) const;
	bool HasAttribute(std::string_view name) const { return FindAttribute(name) != nullptr; }

private:
	event ReadTag();
	bool SkipPast(const char* end);
	bool SkipDocumentType();
	void SkipBlanks();
	std::string_view ReadName();
	bool ReadAttributes();
	const std::string_view* FindAttribute(std::string_view name) const;

	// Parts of the document as they stand there: most of them nobody asks for.
	std::string_view fRest;
	std::string_view fName;
	std::string_view fText;
	std::vector<std::pair<std::string_view, std::string_view>> fAttributes;
	bool fIsCharacterData;
	bool fClosesItself;
};

/// The text with the five special characters replaced by references.
std::string xml_escape(const std::string& text);
/// Whether the text can be part of a document: UTF-8 without controls other than blanks.
bool is_xml_text(const char* text);

} // namespace BPrivate

#endif
