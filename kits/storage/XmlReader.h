// SPDX-License-Identifier: MIT
// Reads the little of XML that packages of the MIME database use.

#ifndef _XML_READER_H
#define _XML_READER_H

#include <map>
#include <string>
#include <string_view>

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
	const std::string& Name() const { return fName; }
	/// Of a text, references resolved.
	const std::string& Text() const { return fText; }
	/// Of a start tag; null when absent.
	const std::string* Attribute(const char* name) const;

private:
	event ReadTag();
	bool SkipPast(const char* end);
	bool SkipDocumentType();
	void SkipBlanks();
	std::string ReadName();
	bool ReadAttributes();

	std::string_view fRest;
	std::string fName;
	std::string fText;
	std::map<std::string, std::string> fAttributes;
	bool fClosesItself;
};

/// The text with the five special characters replaced by references.
std::string xml_escape(const std::string& text);
/// Whether the text can be part of a document: UTF-8 without controls other than blanks.
bool is_xml_text(const char* text);

} // namespace BPrivate

#endif
