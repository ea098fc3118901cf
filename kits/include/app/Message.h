// SPDX-License-Identifier: MIT
// The message: a code and named, typed fields; what programs send, drag, store and put on the clipboard.
#ifndef _MESSAGE_H
#define _MESSAGE_H

#include <AppDefs.h>
#include <OS.h>
#include <Rect.h>
#include <TypeConstants.h>

class BDataIO;
class BFlattenable;
class BHandler;
class BMessenger;
class BSize;
class BString;
class BStringList;
struct entry_ref;
struct rgb_color;

enum {
	B_NO_SPECIFIER = 0,
	B_DIRECT_SPECIFIER = 1,
	B_INDEX_SPECIFIER,
	B_REVERSE_INDEX_SPECIFIER,
	B_RANGE_SPECIFIER,
	B_REVERSE_RANGE_SPECIFIER,
	B_NAME_SPECIFIER,
	B_ID_SPECIFIER,
	B_SPECIFIERS_END = 128
};

#define B_FIELD_NAME_LENGTH 255
#define B_PROPERTY_NAME_LENGTH 255


/// A code and an ordered set of fields. A field is a name (up to 255 bytes) with one type and one or
/// more items, counted from 0. Names are compared byte by byte.
///
/// Adding to a name that exists appends an item; with another type it fails with B_BAD_TYPE. Removing
/// the last item removes the field; replacing never adds. Finding gives B_NAME_NOT_FOUND, B_BAD_TYPE,
/// B_BAD_INDEX, or B_BAD_DATA for an item that came from a file and is not of its type's form; the
/// value is then zero or empty. Null names and null data give B_BAD_VALUE.
///
/// Pointers into the message (strings, data, field names) hold until the message changes. Nothing here
/// locks: one thread may change a message, or several may read it. Needs no application object and works
/// in static objects.
class BMessage {
public:
	class Private;

	/// The command. Free to change at any time; not one of the fields.
	uint32 what;

	BMessage();
	BMessage(uint32 what);

	/// Copies code and fields, not the delivery state: a reply cannot be sent through a copy.
	BMessage(const BMessage& other);
	BMessage& operator=(const BMessage& other);

	/// Sends B_NO_REPLY to a sender that still waits for a reply.
	virtual ~BMessage();

	/// The \a index-th field of a type (B_ANY_TYPE: of all), in the order of first addition. Each result
	/// may be null. Returns B_OK; B_BAD_INDEX past the end; B_BAD_TYPE when no field has that type.
	status_t GetInfo(type_code typeRequested, int32 index, char** nameFound, type_code* typeFound,
		int32* countFound = NULL) const;
	status_t GetInfo(const char* name, type_code* typeFound, int32* countFound = NULL) const;
	status_t GetInfo(const char* name, type_code* typeFound, bool* fixedSize) const;
	status_t GetInfo(
		const char* name, type_code* typeFound, int32* countFound, bool* fixedSize) const;
	int32 CountNames(type_code type) const;
	bool IsEmpty() const;

	/// Whether the code is an underscore and three capital letters, as the system's own are.
	bool IsSystem() const;
	bool IsReply() const;

	/// Writes the message to standard output, one item a line.
	void PrintToStream() const;

	/// Gives a field another name; it keeps its place. B_NAME_IN_USE when that name exists.
	status_t Rename(const char* oldEntry, const char* newEntry);

	bool WasDelivered() const;

	/// Whether the sender is blocked until this message is answered or deleted.
	bool IsSourceWaiting() const;
	bool IsSourceRemote() const;

	/// The handler that a reply goes to; invalid for a message that was not delivered.
	BMessenger ReturnAddress() const;

	/// For a reply: the message it answers, this message's own; otherwise null.
	const BMessage* Previous() const;
	bool WasDropped() const;

	/// Where a dropped message was let go, in screen coordinates. \a offset: from the left top corner of
	/// the dragged rectangle to the pointer. (0, 0) for a message that was not dropped.
	BPoint DropPoint(BPoint* offset = NULL) const;

	/// Answers the sender with a copy of \a reply. B_BAD_REPLY when this message was never delivered,
	/// B_DUPLICATE_REPLY when a waiting sender has its answer already. Timeouts in microseconds.
	status_t SendReply(uint32 command, BHandler* replyTo = NULL);
	status_t SendReply(
		BMessage* reply, BHandler* replyTo = NULL, bigtime_t timeout = B_INFINITE_TIMEOUT);
	status_t SendReply(BMessage* reply, BMessenger replyTo, bigtime_t timeout = B_INFINITE_TIMEOUT);
	status_t SendReply(uint32 command, BMessage* replyToReply);
	status_t SendReply(BMessage* reply, BMessage* replyToReply,
		bigtime_t sendTimeout = B_INFINITE_TIMEOUT, bigtime_t replyTimeout = B_INFINITE_TIMEOUT);

	ssize_t FlattenedSize() const;

	/// Writes FlattenedSize() bytes. B_BUFFER_OVERFLOW, nothing written, when \a size is less.
	status_t Flatten(char* buffer, ssize_t size) const;

	/// \a size: the bytes written, set on B_OK only; may be null.
	status_t Flatten(BDataIO* stream, ssize_t* size = NULL) const;

	/// Replaces code and fields; bytes after the message are ignored, and not read from a stream.
	/// Returns B_OK; B_NOT_A_MESSAGE, nothing changed, when the data does not begin like a message;
	/// B_BAD_VALUE for a damaged message and a stream's error for a failed read: no fields are left then.
	/// \a flatBuffer must be as long as its own header says; use the stream form when it may be cut off.
	status_t Unflatten(const char* flatBuffer);
	status_t Unflatten(BDataIO* stream);

	status_t AddSpecifier(const char* property);
	status_t AddSpecifier(const char* property, int32 index);
	status_t AddSpecifier(const char* property, int32 index, int32 range);
	status_t AddSpecifier(const char* property, const char* name);
	status_t AddSpecifier(const BMessage* specifier);
	status_t SetCurrentSpecifier(int32 index);

	/// B_BAD_SCRIPT_SYNTAX when no specifier is left or the message was not delivered. Results may be
	/// null.
	status_t GetCurrentSpecifier(int32* index, BMessage* specifier = NULL, int32* what = NULL,
		const char** property = NULL) const;
	bool HasSpecifiers() const;
	status_t PopSpecifier();

	/// Adds every item of every field of \a message.
	status_t Append(const BMessage& message);

	/// Whether both have the same fields with the same items. \a deep: nested messages are compared by
	/// content, in whatever format and order of fields, and not by their bytes.
	bool HasSameData(const BMessage& other, bool ignoreFieldOrder = true, bool deep = false) const;

	/// Removes all fields and keeps the code; a sender that still waits is sent B_NO_REPLY first.
	status_t MakeEmpty();
	status_t RemoveName(const char* name);
	status_t RemoveData(const char* name, int32 index = 0);

	// Adding: B_OK, B_BAD_VALUE, B_BAD_TYPE or B_NO_MEMORY. Objects are copied and stay the caller's.

	status_t AddBool(const char* name, bool value);
	status_t AddInt8(const char* name, int8 value);
	status_t AddUInt8(const char* name, uint8 value);
	status_t AddInt16(const char* name, int16 value);
	status_t AddUInt16(const char* name, uint16 value);
	status_t AddInt32(const char* name, int32 value);
	status_t AddUInt32(const char* name, uint32 value);
	status_t AddInt64(const char* name, int64 value);
	status_t AddUInt64(const char* name, uint64 value);
	status_t AddFloat(const char* name, float value);
	status_t AddDouble(const char* name, double value);
	status_t AddPoint(const char* name, BPoint value);
	status_t AddRect(const char* name, BRect value);
	status_t AddSize(const char* name, BSize value);
	status_t AddColor(const char* name, rgb_color value);
	status_t AddString(const char* name, const char* value);
	status_t AddString(const char* name, const BString& value);
	status_t AddStrings(const char* name, const BStringList& list);
	status_t AddPointer(const char* name, const void* value);
	status_t AddRef(const char* name, const entry_ref* value);
	status_t AddMessage(const char* name, const BMessage* value);
	status_t AddMessenger(const char* name, BMessenger value);
	status_t AddFlat(const char* name, BFlattenable* object, int32 count = 1);
	status_t AddFlat(const char* name, const BFlattenable* object, int32 count = 1);

	/// \a numBytes more than 0. All items of a fixed size field have the same size, else B_BAD_VALUE;
	/// the field's first item decides which kind it is. \a count is a hint.
	status_t AddData(const char* name, type_code type, const void* data, ssize_t numBytes,
		bool isFixedSize = true, int32 count = 1);

	// Replacing: one item, the first or the one at index.

	status_t ReplaceBool(const char* name, bool value);
	status_t ReplaceBool(const char* name, int32 index, bool value);
	status_t ReplaceInt8(const char* name, int8 value);
	status_t ReplaceInt8(const char* name, int32 index, int8 value);
	status_t ReplaceUInt8(const char* name, uint8 value);
	status_t ReplaceUInt8(const char* name, int32 index, uint8 value);
	status_t ReplaceInt16(const char* name, int16 value);
	status_t ReplaceInt16(const char* name, int32 index, int16 value);
	status_t ReplaceUInt16(const char* name, uint16 value);
	status_t ReplaceUInt16(const char* name, int32 index, uint16 value);
	status_t ReplaceInt32(const char* name, int32 value);
	status_t ReplaceInt32(const char* name, int32 index, int32 value);
	status_t ReplaceUInt32(const char* name, uint32 value);
	status_t ReplaceUInt32(const char* name, int32 index, uint32 value);
	status_t ReplaceInt64(const char* name, int64 value);
	status_t ReplaceInt64(const char* name, int32 index, int64 value);
	status_t ReplaceUInt64(const char* name, uint64 value);
	status_t ReplaceUInt64(const char* name, int32 index, uint64 value);
	status_t ReplaceFloat(const char* name, float value);
	status_t ReplaceFloat(const char* name, int32 index, float value);
	status_t ReplaceDouble(const char* name, double value);
	status_t ReplaceDouble(const char* name, int32 index, double value);
	status_t ReplacePoint(const char* name, BPoint value);
	status_t ReplacePoint(const char* name, int32 index, BPoint value);
	status_t ReplaceRect(const char* name, BRect value);
	status_t ReplaceRect(const char* name, int32 index, BRect value);
	status_t ReplaceSize(const char* name, BSize value);
	status_t ReplaceSize(const char* name, int32 index, BSize value);
	status_t ReplaceColor(const char* name, rgb_color value);
	status_t ReplaceColor(const char* name, int32 index, rgb_color value);
	status_t ReplaceString(const char* name, const char* value);
	status_t ReplaceString(const char* name, int32 index, const char* value);
	status_t ReplaceString(const char* name, const BString& value);
	status_t ReplaceString(const char* name, int32 index, const BString& value);
	status_t ReplacePointer(const char* name, const void* value);
	status_t ReplacePointer(const char* name, int32 index, const void* value);
	status_t ReplaceRef(const char* name, const entry_ref* value);
	status_t ReplaceRef(const char* name, int32 index, const entry_ref* value);
	status_t ReplaceMessage(const char* name, const BMessage* value);
	status_t ReplaceMessage(const char* name, int32 index, const BMessage* value);
	status_t ReplaceMessenger(const char* name, BMessenger value);
	status_t ReplaceMessenger(const char* name, int32 index, BMessenger value);
	status_t ReplaceFlat(const char* name, BFlattenable* object);
	status_t ReplaceFlat(const char* name, int32 index, BFlattenable* object);
	status_t ReplaceData(const char* name, type_code type, const void* data, ssize_t numBytes);
	status_t ReplaceData(
		const char* name, type_code type, int32 index, const void* data, ssize_t numBytes);

	// Finding: one item, the first or the one at index.

	status_t FindBool(const char* name, bool* value) const;
	status_t FindBool(const char* name, int32 index, bool* value) const;
	status_t FindInt8(const char* name, int8* value) const;
	status_t FindInt8(const char* name, int32 index, int8* value) const;
	status_t FindUInt8(const char* name, uint8* value) const;
	status_t FindUInt8(const char* name, int32 index, uint8* value) const;
	status_t FindInt16(const char* name, int16* value) const;
	status_t FindInt16(const char* name, int32 index, int16* value) const;
	status_t FindUInt16(const char* name, uint16* value) const;
	status_t FindUInt16(const char* name, int32 index, uint16* value) const;
	status_t FindInt32(const char* name, int32* value) const;
	status_t FindInt32(const char* name, int32 index, int32* value) const;
	status_t FindUInt32(const char* name, uint32* value) const;
	status_t FindUInt32(const char* name, int32 index, uint32* value) const;
	status_t FindInt64(const char* name, int64* value) const;
	status_t FindInt64(const char* name, int32 index, int64* value) const;
	status_t FindUInt64(const char* name, uint64* value) const;
	status_t FindUInt64(const char* name, int32 index, uint64* value) const;
	status_t FindFloat(const char* name, float* value) const;
	status_t FindFloat(const char* name, int32 index, float* value) const;
	status_t FindDouble(const char* name, double* value) const;
	status_t FindDouble(const char* name, int32 index, double* value) const;
	status_t FindPoint(const char* name, BPoint* value) const;
	status_t FindPoint(const char* name, int32 index, BPoint* value) const;
	status_t FindRect(const char* name, BRect* value) const;
	status_t FindRect(const char* name, int32 index, BRect* value) const;
	status_t FindSize(const char* name, BSize* value) const;
	status_t FindSize(const char* name, int32 index, BSize* value) const;
	status_t FindColor(const char* name, rgb_color* value) const;
	status_t FindColor(const char* name, int32 index, rgb_color* value) const;
	status_t FindString(const char* name, const char** value) const;
	status_t FindString(const char* name, int32 index, const char** value) const;
	status_t FindString(const char* name, BString* value) const;
	status_t FindString(const char* name, int32 index, BString* value) const;
	status_t FindPointer(const char* name, void** value) const;
	status_t FindPointer(const char* name, int32 index, void** value) const;
	status_t FindRef(const char* name, entry_ref* value) const;
	status_t FindRef(const char* name, int32 index, entry_ref* value) const;
	status_t FindMessage(const char* name, BMessage* value) const;
	status_t FindMessage(const char* name, int32 index, BMessage* value) const;
	status_t FindMessenger(const char* name, BMessenger* value) const;
	status_t FindMessenger(const char* name, int32 index, BMessenger* value) const;
	status_t FindStrings(const char* name, BStringList* list) const;
	status_t FindFlat(const char* name, BFlattenable* object) const;
	status_t FindFlat(const char* name, int32 index, BFlattenable* object) const;

	/// \a type may be B_ANY_TYPE.
	status_t FindData(const char* name, type_code type, const void** data, ssize_t* numBytes) const;
	status_t FindData(
		const char* name, type_code type, int32 index, const void** data, ssize_t* numBytes) const;

	// Finding by value: zero, empty or null when the item is not there.

	bool FindBool(const char* name, int32 index = 0) const;
	const char* FindString(const char* name, int32 index = 0) const;
	int8 FindInt8(const char* name, int32 index = 0) const;
	int16 FindInt16(const char* name, int32 index = 0) const;
	int32 FindInt32(const char* name, int32 index = 0) const;
	int64 FindInt64(const char* name, int32 index = 0) const;
	float FindFloat(const char* name, int32 index = 0) const;
	double FindDouble(const char* name, int32 index = 0) const;
	BPoint FindPoint(const char* name, int32 index = 0) const;
	BRect FindRect(const char* name, int32 index = 0) const;

	// Asking whether an item is there.

	bool HasBool(const char* name, int32 index = 0) const;
	bool HasInt8(const char* name, int32 index = 0) const;
	bool HasUInt8(const char* name, int32 index = 0) const;
	bool HasInt16(const char* name, int32 index = 0) const;
	bool HasUInt16(const char* name, int32 index = 0) const;
	bool HasInt32(const char* name, int32 index = 0) const;
	bool HasUInt32(const char* name, int32 index = 0) const;
	bool HasInt64(const char* name, int32 index = 0) const;
	bool HasUInt64(const char* name, int32 index = 0) const;
	bool HasFloat(const char* name, int32 index = 0) const;
	bool HasDouble(const char* name, int32 index = 0) const;
	bool HasPoint(const char* name, int32 index = 0) const;
	bool HasRect(const char* name, int32 index = 0) const;
	bool HasSize(const char* name, int32 index = 0) const;
	bool HasColor(const char* name, int32 index = 0) const;
	bool HasString(const char* name, int32 index = 0) const;
	bool HasPointer(const char* name, int32 index = 0) const;
	bool HasRef(const char* name, int32 index = 0) const;
	bool HasMessage(const char* name, int32 index = 0) const;
	bool HasMessenger(const char* name, int32 index = 0) const;
	bool HasFlat(const char* name, const BFlattenable* object) const;
	bool HasFlat(const char* name, int32 n, const BFlattenable* object) const;
	bool HasData(const char* name, type_code type, int32 n = 0) const;

	// Finding with a value for the case that the item is not there.

	bool GetBool(const char* name, bool defaultValue = false) const;
	bool GetBool(const char* name, int32 index, bool defaultValue) const;
	int8 GetInt8(const char* name, int8 defaultValue = 0) const;
	int8 GetInt8(const char* name, int32 index, int8 defaultValue) const;
	uint8 GetUInt8(const char* name, uint8 defaultValue = 0) const;
	uint8 GetUInt8(const char* name, int32 index, uint8 defaultValue) const;
	int16 GetInt16(const char* name, int16 defaultValue = 0) const;
	int16 GetInt16(const char* name, int32 index, int16 defaultValue) const;
	uint16 GetUInt16(const char* name, uint16 defaultValue = 0) const;
	uint16 GetUInt16(const char* name, int32 index, uint16 defaultValue) const;
	int32 GetInt32(const char* name, int32 defaultValue = 0) const;
	int32 GetInt32(const char* name, int32 index, int32 defaultValue) const;
	uint32 GetUInt32(const char* name, uint32 defaultValue = 0) const;
	uint32 GetUInt32(const char* name, int32 index, uint32 defaultValue) const;
	int64 GetInt64(const char* name, int64 defaultValue = 0) const;
	int64 GetInt64(const char* name, int32 index, int64 defaultValue) const;
	uint64 GetUInt64(const char* name, uint64 defaultValue = 0) const;
	uint64 GetUInt64(const char* name, int32 index, uint64 defaultValue) const;
	float GetFloat(const char* name, float defaultValue = 0) const;
	float GetFloat(const char* name, int32 index, float defaultValue) const;
	double GetDouble(const char* name, double defaultValue = 0) const;
	double GetDouble(const char* name, int32 index, double defaultValue) const;
	BPoint GetPoint(const char* name, const BPoint& defaultValue) const;
	BPoint GetPoint(const char* name, int32 index, const BPoint& defaultValue) const;
	BRect GetRect(const char* name, const BRect& defaultValue) const;
	BRect GetRect(const char* name, int32 index, const BRect& defaultValue) const;
	BSize GetSize(const char* name, const BSize& defaultValue) const;
	BSize GetSize(const char* name, int32 index, const BSize& defaultValue) const;
	rgb_color GetColor(const char* name, rgb_color defaultValue) const;
	rgb_color GetColor(const char* name, int32 index, rgb_color defaultValue) const;
	const char* GetString(const char* name, const char* defaultValue = NULL) const;
	const char* GetString(const char* name, int32 index, const char* defaultValue) const;
	const void* GetPointer(const char* name, const void* defaultValue = NULL) const;
	const void* GetPointer(const char* name, int32 index, const void* defaultValue) const;

	// Setting: replaces the first item of the field, or adds the field.

	status_t SetBool(const char* name, bool value);
	status_t SetInt8(const char* name, int8 value);
	status_t SetUInt8(const char* name, uint8 value);
	status_t SetInt16(const char* name, int16 value);
	status_t SetUInt16(const char* name, uint16 value);
	status_t SetInt32(const char* name, int32 value);
	status_t SetUInt32(const char* name, uint32 value);
	status_t SetInt64(const char* name, int64 value);
	status_t SetUInt64(const char* name, uint64 value);
	status_t SetFloat(const char* name, float value);
	status_t SetDouble(const char* name, double value);
	status_t SetPoint(const char* name, const BPoint& value);
	status_t SetRect(const char* name, const BRect& value);
	status_t SetSize(const char* name, const BSize& value);
	status_t SetColor(const char* name, rgb_color value);
	status_t SetString(const char* name, const char* value);
	status_t SetString(const char* name, const BString& value);
	status_t SetPointer(const char* name, const void* value);
	status_t SetFlat(const char* name, const BFlattenable* object, int32 count = 1);
	status_t SetData(const char* name, type_code type, const void* data, ssize_t numBytes,
		bool isFixedSize = true, int32 count = 1);

private:
	struct Field;
	struct FieldName;
	struct Body;

	void InitHeader();
	void Clear();
	void CopyFrom(const BMessage& other);
	status_t DeliverReply(const BMessage& reply, const BMessenger* replyTo, BMessage* answer,
		bigtime_t sendTimeout, bigtime_t replyTimeout);

	void FlattenHeaders(char* buffer) const;
	void PrintIndented(int32 depth) const;

	int32 CountFields() const;
	int32 IndexOf(const char* name) const;
	int32 IndexOf(const FieldName& name) const;
	status_t FindField(const char* name, type_code type, int32* field) const;
	status_t FindItem(int32 field, int32 index, const uint8** data, uint32* size) const;
	status_t FindValue(
		const char* name, type_code type, int32 index, void* value, size_t size) const;
	bool HasValue(const char* name, type_code type, int32 index, size_t size) const;

	status_t AddField(
		const FieldName& name, type_code type, bool isFixedSize, const void* data, uint32 size);
	status_t AddItem(int32 field, const void* data, uint32 size);
	status_t ReplaceItem(int32 field, int32 index, const void* data, uint32 size);
	status_t RemoveField(int32 field);
	void Link(int32 field);
	void Unlink(int32 field);
	status_t Reserve(uint32 moreFields, uint32 moreData);
	status_t ResizeBytes(int32 field, uint32 offset, uint32 oldSize, uint32 newSize);
	bool Owns(const void* bytes) const;

	uint32 fFlags;
	int32 fTarget;
	int32 fCurrentSpecifier;
	int32 fReplyPort;
	int32 fReplyTarget;
	int32 fReplyTeam;
	// Set while this very object is a delivery: flags that were read from a file answer nobody.
	bool fIsLive;
	// The fields in one block of memory; may be null while there are none.
	Body* fBody;
	const BMessage* fOriginal;
};

#endif // _MESSAGE_H
