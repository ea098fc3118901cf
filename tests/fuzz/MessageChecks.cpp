// SPDX-License-Identifier: MIT
// What must hold for any bytes that are read as a message.

#include "fuzz/MessageChecks.h"

#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <string>
#include <vector>

#include <DataIO.h>
#include <Entry.h>
#include <GraphicsDefs.h>
#include <Message.h>
#include <Messenger.h>
#include <Point.h>
#include <Size.h>
#include <String.h>

#include "app/MessagePrivate.h"
#include "fuzz/Require.h"

namespace {

constexpr int kDepth = 4;
constexpr int32 kItems = 64;
constexpr int32 kEdits = 32;


/// A stream that can only be read, and gives little at a time.
class Pipe : public BDataIO {
public:
	Pipe(const uint8_t* bytes, size_t size)
		: fBytes(bytes),
		  fLeft(size)
	{
	}

	ssize_t Read(void* buffer, size_t size) override
	{
		if (size > 7)
			size = size / 2;
		if (size > fLeft)
			size = fLeft;
		memcpy(buffer, fBytes, size);
		fBytes += size;
		fLeft -= size;
		return ssize_t(size);
	}

	size_t Left() const { return fLeft; }

private:
	const uint8_t* fBytes;
	size_t fLeft;
};


std::string
Flat(const BMessage& message)
{
	std::string bytes(message.FlattenedSize(), '\0');
	REQUIRE(message.Flatten(bytes.data(), ssize_t(bytes.size())) == B_OK);
	return bytes;
}


/// The flattened message without the hash table and the links, which depend on the past.
std::string
FlatContent(const BMessage& message)
{
	std::string bytes = Flat(message);
	uint32 fieldCount;
	memcpy(&fieldCount, &bytes[40], sizeof(fieldCount));
	memset(&bytes[48], 0, 20);
	for (uint32 i = 0; i < fieldCount; i++)
		memset(&bytes[68 + i * 24 + 20], 0, 4);
	return bytes;
}


/// Calls every find function on one item. The value does not matter, what is touched does.
template <typename Value>
bool
Find(const BMessage& message, status_t (BMessage::*find)(const char*, int32, Value*) const,
	bool (BMessage::*has)(const char*, int32) const, const char* name, int32 index)
{
	Value value{};
	const bool isFound = (message.*find)(name, index, &value) == B_OK;
	REQUIRE((message.*has)(name, index) == isFound);
	return isFound;
}


void FindEverything(const BMessage& message, int depth);


void
FindItem(const BMessage& message, const char* name, int32 i, int depth)
{
	int found = 0;
	found += Find<bool>(message, &BMessage::FindBool, &BMessage::HasBool, name, i);
	found += Find<int8>(message, &BMessage::FindInt8, &BMessage::HasInt8, name, i);
	found += Find<uint8>(message, &BMessage::FindUInt8, &BMessage::HasUInt8, name, i);
	found += Find<int16>(message, &BMessage::FindInt16, &BMessage::HasInt16, name, i);
	found += Find<uint16>(message, &BMessage::FindUInt16, &BMessage::HasUInt16, name, i);
	found += Find<int32>(message, &BMessage::FindInt32, &BMessage::HasInt32, name, i);
	found += Find<uint32>(message, &BMessage::FindUInt32, &BMessage::HasUInt32, name, i);
	found += Find<int64>(message, &BMessage::FindInt64, &BMessage::HasInt64, name, i);
	found += Find<uint64>(message, &BMessage::FindUInt64, &BMessage::HasUInt64, name, i);
	found += Find<float>(message, &BMessage::FindFloat, &BMessage::HasFloat, name, i);
	found += Find<double>(message, &BMessage::FindDouble, &BMessage::HasDouble, name, i);
	found += Find<BPoint>(message, &BMessage::FindPoint, &BMessage::HasPoint, name, i);
	found += Find<BRect>(message, &BMessage::FindRect, &BMessage::HasRect, name, i);
	found += Find<BSize>(message, &BMessage::FindSize, &BMessage::HasSize, name, i);
	found += Find<rgb_color>(message, &BMessage::FindColor, &BMessage::HasColor, name, i);
	found += Find<void*>(message, &BMessage::FindPointer, &BMessage::HasPointer, name, i);

	const char* text;
	if (message.FindString(name, i, &text) == B_OK) {
		found++;
		BString string;
		REQUIRE(message.FindString(name, i, &string) == B_OK);
		REQUIRE(string == text);
	} else {
		REQUIRE(text == nullptr);
	}
	REQUIRE(found <= 1);

	const void* data;
	ssize_t size;
	if (message.FindData(name, B_ANY_TYPE, i, &data, &size) == B_OK) {
		// Every byte is there.
		REQUIRE(size > 0);
		REQUIRE(std::string(static_cast<const char*>(data), size).size() == size_t(size));
	} else {
		REQUIRE(found == 0);
	}

	BMessage nested;
	if (depth < kDepth && message.FindMessage(name, i, &nested) == B_OK)
		FindEverything(nested, depth + 1);
	entry_ref ref;
	message.FindRef(name, i, &ref);
}


void
FindEverything(const BMessage& message, int depth)
{
	char* name;
	type_code type;
	int32 count;
	int32 fields = 0;
	while (message.GetInfo(B_ANY_TYPE, fields, &name, &type, &count) == B_OK) {
		fields++;
		REQUIRE(count > 0);
		for (int32 i = -1; i <= count && i < kItems; i++)
			FindItem(message, name, i, depth);
		FindItem(message, name, count - 1, depth);
		FindItem(message, name, count, depth);
	}
	REQUIRE(fields == message.CountNames(B_ANY_TYPE));
	REQUIRE(message.IsEmpty() == (fields == 0));
}


void
CheckWriting(const BMessage& message)
{
	const std::string bytes = Flat(message);
	BMessage again;
	size_t used = 0;
	REQUIRE(BMessage::Private(again).Unflatten(bytes.data(), bytes.size(), &used) == B_OK);
	REQUIRE(used == bytes.size());
	REQUIRE(Flat(again) == bytes);

	BMallocIO stream;
	ssize_t size = 0;
	REQUIRE(message.Flatten(&stream, &size) == B_OK);
	REQUIRE(std::string(static_cast<const char*>(stream.Buffer()), stream.BufferLength()) == bytes);

	// An empty item can be read in the one format and not written in the other, and fields that are
	// told apart by names longer than 255 bytes run together.
	BMessage::Private r5(again);
	std::string r5Bytes(r5.R5FlattenedSize(), '\0');
	REQUIRE(r5.FlattenR5(r5Bytes.data(), ssize_t(r5Bytes.size())) == B_OK);
	BMessage fromR5;
	if (BMessage::Private(fromR5).Unflatten(r5Bytes.data(), r5Bytes.size(), &used) != B_OK)
		return;
	REQUIRE(used == r5Bytes.size());
	if (fromR5.CountNames(B_ANY_TYPE) != message.CountNames(B_ANY_TYPE))
		return;
	BMessage::Private r5Again(fromR5);
	REQUIRE(r5Again.R5FlattenedSize() == ssize_t(r5Bytes.size()));
	std::string r5BytesAgain(r5Bytes.size(), '\0');
	REQUIRE(r5Again.FlattenR5(r5BytesAgain.data(), ssize_t(r5BytesAgain.size())) == B_OK);
	REQUIRE(r5BytesAgain == r5Bytes);
}


/// Changes the message as the bytes tell. After each step it must be readable and hold what it did.
void
Edit(BMessage* message, const uint8_t* bytes, size_t size)
{
	for (int32 step = 0; step < kEdits && size >= 4; step++, bytes += 4, size -= 4) {
		char* found = nullptr;
		type_code type = 0;
		int32 count = 0;
		message->GetInfo(B_ANY_TYPE, bytes[1], &found, &type, &count);
		// Some are new names, some those of fields; copied or the message's own bytes.
		const std::string copy = found != nullptr ? found : std::string(bytes[1] % 4, 'a');
		const char* name = found != nullptr && bytes[0] >= 0x80 ? found : copy.c_str();
		const int32 index = count > 0 ? bytes[2] % (count + 1) : 0;
		const std::string value(bytes[3], 'v');
		const int32 fieldCount = message->CountNames(B_ANY_TYPE);

		switch (bytes[0] % 9) {
			case 0:
				message->AddString(name, value.c_str());
				break;
			case 1:
				message->ReplaceString(name, index, value.c_str());
				break;
			case 2:
				message->RemoveData(name, index);
				break;
			case 3:
				if (message->RemoveName(name) == B_OK)
					REQUIRE(message->CountNames(B_ANY_TYPE) == fieldCount - 1);
				break;
			case 4:
				if (message->Rename(name, value.c_str()) == B_OK)
					REQUIRE(message->HasData(value.c_str(), B_ANY_TYPE)
						|| message->GetInfo(value.c_str(), &type) == B_OK);
				break;
			case 5:
				message->AddData(name, type, value.data(), ssize_t(value.size()), index > 0);
				break;
			case 6:
				message->ReplaceData(name, type, index, value.data(), ssize_t(value.size()));
				break;
			case 7:
			{
				const void* data;
				ssize_t dataSize;
				if (message->FindData(name, B_ANY_TYPE, index, &data, &dataSize) == B_OK)
					message->AddData(name, type, data, dataSize, true);
				break;
			}
			case 8:
			{
				const BMessage nested(*message);
				if (message->FlattenedSize() < 4096)
					message->AddMessage(name, &nested);
				break;
			}
		}

		// Items outside the touched field must not have moved against each other.
		const std::string flat = Flat(*message);
		BMessage again;
		REQUIRE(BMessage::Private(again).Unflatten(flat.data(), flat.size()) == B_OK);
		REQUIRE(Flat(again) == flat);
	}
}


/// A message that was changed equals one built afresh, links aside.
void
CheckRebuilding(const BMessage& message)
{
	BMessage copy(message);
	BMessage rebuilt(message);
	rebuilt.MakeEmpty();
	BMessage::Private(copy).ClearDelivery();
	if (rebuilt.Append(copy) != B_OK)
		return; // a name twice, or an empty item, as only a file can have them
	BMessage::Private(rebuilt).ClearDelivery();
	BMessage header(copy.what);
	header.Append(copy);
	if (copy.HasSpecifiers() || rebuilt.CountNames(B_ANY_TYPE) != copy.CountNames(B_ANY_TYPE))
		return;
	std::string expected = FlatContent(copy);
	std::string actual = FlatContent(rebuilt);
	// The current specifier and unknown flags of fields come only from a file.
	memset(&expected[20], 0, 4);
	memset(&actual[20], 0, 4);
	memset(&expected[16], 0, 4);
	memset(&actual[16], 0, 4);
	uint32 fieldCount;
	memcpy(&fieldCount, &expected[40], sizeof(fieldCount));
	for (uint32 i = 0; i < fieldCount; i++) {
		expected[68 + i * 24] &= 2;
		actual[68 + i * 24] &= 2;
		expected[69 + i * 24] = actual[69 + i * 24] = 0;
	}
	REQUIRE(actual == expected);
}

} // namespace


void
CheckMessageBytes(const uint8_t* bytes, size_t size)
{
	BMessage message('kept');
	message.AddInt32("before", 1);
	size_t used = 0;
	const status_t status = BMessage::Private(message).Unflatten(bytes, size, &used);
	REQUIRE(status == B_OK || status == B_BAD_VALUE || status == B_NOT_A_MESSAGE);
	REQUIRE(used <= size);
	if (status == B_NOT_A_MESSAGE)
		REQUIRE(message.HasInt32("before"));
	if (status == B_BAD_VALUE)
		REQUIRE(message.IsEmpty() && message.what == 'kept');

	BMemoryIO positioned(bytes, size);
	BMessage fromStream;
	REQUIRE(fromStream.Unflatten(&positioned) == status);
	Pipe pipe(bytes, size);
	BMessage fromPipe;
	REQUIRE(fromPipe.Unflatten(&pipe) == status);
	if (status != B_OK)
		return;

	const std::string flat = Flat(message);
	REQUIRE(positioned.Position() == off_t(used) && pipe.Left() == size - used);
	REQUIRE(Flat(fromStream) == flat && Flat(fromPipe) == flat);

	FindEverything(message, 0);
	CheckWriting(message);
	BMessage edited(message);
	Edit(&edited, bytes + used, size - used);
	CheckWriting(edited);
	FindEverything(edited, 0);
	CheckRebuilding(edited);
	REQUIRE(message.HasSameData(message, false, true));
}
