// SPDX-License-Identifier: MIT
// Texts of BTranslationUtils. Styled text is a row of records, each with a header of words, high byte
// first: its code, the header's bytes, the data's bytes. 'STXT' comes first, 'TEXT' holds the text and
// 'STYL' its fonts and colours (a flattened run array).
#include <TranslationUtils.h>

#include <cstdlib>
#include <cstring>
#include <memory>
#include <string>
#include <vector>

#include <ByteOrder.h>
#include <TextView.h>

#include "interface/TextStyles.h"
#include "translation/StreamBytes.h"

namespace {

constexpr uint32 kStreamMagic = 'STXT';
constexpr uint32 kTextMagic = 'TEXT';
constexpr uint32 kStyleMagic = 'STYL';
constexpr uint32 kStreamVersion = 100;
constexpr uint32 kUnicode = 65535;
constexpr size_t kRecordHeader = 12;

class Bytes {
public:
	void AddWord(uint32 value)
	{
		value = B_HOST_TO_BENDIAN_INT32(value);
		fText.append(reinterpret_cast<const char*>(&value), sizeof(value));
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


/// What the records hold.
struct Contents {
	std::string text;
	BPrivate::RunArray runs;
};


/// B_BAD_DATA when a record is cut off or there is no text. Damaged styles are left out.
status_t
ReadRecords(const std::vector<uint8>& bytes, Contents* contents)
{
	bool hasText = false;
	size_t place = 0;
	while (bytes.size() - place >= kRecordHeader) {
		const uint32 magic = WordAt(bytes, place);
		const uint64 headerSize = WordAt(bytes, place + 4);
		const uint64 dataSize = WordAt(bytes, place + 8);
		if (headerSize < kRecordHeader || headerSize + dataSize > bytes.size() - place)
			return B_BAD_DATA;
		const uint8* data = bytes.data() + place + headerSize;
		if (magic == kTextMagic && !hasText) {
			contents->text.assign(reinterpret_cast<const char*>(data), dataSize);
			hasText = true;
		} else if (magic == kStyleMagic && contents->runs == nullptr)
			contents->runs = BPrivate::ReadFlatRuns(data, static_cast<ssize_t>(dataSize));
		place += static_cast<size_t>(headerSize + dataSize);
	}
	return hasText && place == bytes.size() ? B_OK : B_BAD_DATA;
}


std::string
FlattenRuns(const BTextView* view)
{
	const BPrivate::RunArray runs(view->RunArray(0, view->TextLength()));
	int32 size = 0;
	std::unique_ptr<void, decltype(&std::free)> flat(
		BTextView::FlattenRunArray(runs.get(), &size), &std::free);
	return std::string(static_cast<const char*>(flat.get()), static_cast<size_t>(size));
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
	Contents contents;
	if (bytes.size() >= kRecordHeader && WordAt(bytes, 0) == kStreamMagic)
		status = ReadRecords(bytes, &contents);
	else
		contents.text.assign(bytes.begin(), bytes.end());
	if (status == B_OK)
		intoView->Insert(
			contents.text.c_str(), static_cast<int32>(contents.text.size()), contents.runs.get());
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
