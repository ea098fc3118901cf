// SPDX-License-Identifier: MIT
// Texts of BTranslationUtils. Styled text is a row of records, each with a header of words, high byte
// first: its code, the header's bytes, the data's bytes. 'STXT' comes first, 'TEXT' holds the text and
// 'STYL' its fonts and colours.
#include <TranslationUtils.h>

#include <cstring>
#include <string>
#include <vector>

#include <ByteOrder.h>
#include <Font.h>
#include <TextView.h>

#include "translation/StreamBytes.h"

namespace {

constexpr uint32 kStreamMagic = 'STXT';
constexpr uint32 kTextMagic = 'TEXT';
constexpr uint32 kStyleMagic = 'STYL';
constexpr uint32 kStreamVersion = 100;
constexpr uint32 kUnicode = 65535;
constexpr size_t kRecordHeader = 12;

// A flattened run array: this, a version, the number of runs, the runs.
constexpr uint32 kRunsMagic = 'Ali!';
constexpr size_t kRunNameLength = 64;

class Bytes {
public:
	void AddWord(uint32 value)
	{
		value = B_HOST_TO_BENDIAN_INT32(value);
		fText.append(reinterpret_cast<const char*>(&value), sizeof(value));
	}

	void AddShort(uint16 value)
	{
		value = B_HOST_TO_BENDIAN_INT16(value);
		fText.append(reinterpret_cast<const char*>(&value), sizeof(value));
	}

	void AddFloat(float value)
	{
		uint32 word;
		std::memcpy(&word, &value, sizeof(word));
		AddWord(word);
	}

	void AddByte(uint8 value) { fText += static_cast<char>(value); }

	/// Cut or filled up with zero bytes.
	void AddName(const char* name)
	{
		std::string bytes(name);
		bytes.resize(kRunNameLength - 1);
		fText.append(bytes.c_str(), kRunNameLength);
	}

	void Add(const std::string& text) { fText += text; }

	const std::string& Text() const { return fText; }

private:
	std::string fText;
};


uint32
WordAt(const std::vector<uint8>& bytes, size_t place)
{
	uint32 value;
	std::memcpy(&value, bytes.data() + place, sizeof(value));
	return B_BENDIAN_TO_HOST_INT32(value);
}


/// The text of the records. B_BAD_DATA when they are cut off or have no text.
status_t
FindText(const std::vector<uint8>& bytes, std::string* text)
{
	size_t place = 0;
	while (bytes.size() - place >= kRecordHeader) {
		const uint32 magic = WordAt(bytes, place);
		const uint64 headerSize = WordAt(bytes, place + 4);
		const uint64 dataSize = WordAt(bytes, place + 8);
		if (headerSize < kRecordHeader || headerSize + dataSize > bytes.size() - place)
			return B_BAD_DATA;
		const size_t data = place + static_cast<size_t>(headerSize);
		if (magic == kTextMagic) {
			text->assign(
				reinterpret_cast<const char*>(bytes.data()) + data, static_cast<size_t>(dataSize));
			return B_OK;
		}
		place = data + static_cast<size_t>(dataSize);
	}
	return B_BAD_DATA;
}


/// One run for all of the text: a text view has one font.
std::string
FlattenRuns(const BTextView* view)
{
	BFont font;
	rgb_color color;
	view->GetFontAndColor(0, &font, &color);
	font_family family;
	font_style style;
	font.GetFamilyAndStyle(&family, &style);

	Bytes runs;
	runs.AddWord(kRunsMagic);
	runs.AddWord(0);
	runs.AddWord(1);
	runs.AddWord(0); // the run's first byte
	runs.AddName(family);
	runs.AddName(style);
	runs.AddFloat(font.Size());
	runs.AddFloat(font.Shear());
	runs.AddShort(font.Face());
	for (uint8 part : {color.red, color.green, color.blue, color.alpha})
		runs.AddByte(part);
	runs.AddShort(0);
	return runs.Text();
}

} // namespace


status_t
BTranslationUtils::GetStyledText(
	BPositionIO* fromStream, BTextView* intoView, BTranslatorRoster* roster)
{
	return GetStyledText(fromStream, intoView, nullptr, roster);
}


status_t
BTranslationUtils::GetStyledText(
	BPositionIO* fromStream, BTextView* intoView, const char* encoding, BTranslatorRoster*)
{
	if (fromStream == nullptr || intoView == nullptr)
		return B_BAD_VALUE;
	if (encoding != nullptr && std::strcmp(encoding, "UTF-8") != 0)
		return B_BAD_VALUE;

	std::vector<uint8> bytes;
	status_t status = BPrivate::ReadToEnd(fromStream, &bytes);
	if (status != B_OK)
		return status;
	std::string text(bytes.begin(), bytes.end());
	if (bytes.size() >= kRecordHeader && WordAt(bytes, 0) == kStreamMagic)
		status = FindText(bytes, &text);
	if (status == B_OK)
		intoView->Insert(text.c_str(), static_cast<int32>(text.size()));
	return status;
}


status_t
BTranslationUtils::PutStyledText(BTextView* fromView, BPositionIO* intoStream, BTranslatorRoster*)
{
	if (fromView == nullptr || intoStream == nullptr)
		return B_BAD_VALUE;
	const std::string text(fromView->Text(), static_cast<size_t>(fromView->TextLength()));
	const std::string runs = FlattenRuns(fromView);

	Bytes stream;
	stream.AddWord(kStreamMagic);
	stream.AddWord(kRecordHeader + 4);
	stream.AddWord(0);
	stream.AddWord(kStreamVersion);
	stream.AddWord(kTextMagic);
	stream.AddWord(kRecordHeader + 4);
	stream.AddWord(static_cast<uint32>(text.size()));
	stream.AddWord(kUnicode);
	stream.Add(text);
	stream.AddWord(kStyleMagic);
	stream.AddWord(kRecordHeader + 8);
	stream.AddWord(static_cast<uint32>(runs.size()));
	stream.AddWord(0);
	stream.AddWord(static_cast<uint32>(text.size()));
	stream.Add(runs);

	const ssize_t size = static_cast<ssize_t>(stream.Text().size());
	const ssize_t written = intoStream->Write(stream.Text().data(), static_cast<size_t>(size));
	if (written == size)
		return B_OK;
	return written < 0 ? static_cast<status_t>(written) : B_IO_ERROR;
}
