// SPDX-License-Identifier: MIT
// The text form of a message on standard output.

#include <cctype>
#include <cstdarg>
#include <cstdio>
#include <string>

#include <Entry.h>
#include <GraphicsDefs.h>
#include <Path.h>

#include "app/MessageBody.h"
#include "app/MessagePrivate.h"

namespace {

constexpr int32 kIndent = 8;


__attribute__((format(printf, 1, 2))) std::string
Format(const char* format, ...)
{
	va_list arguments;
	va_start(arguments, format);
	va_list again;
	va_copy(again, arguments);
	std::string text(vsnprintf(nullptr, 0, format, arguments), '\0');
	vsnprintf(text.data(), text.size() + 1, format, again);
	va_end(again);
	va_end(arguments);
	return text;
}


/// The four characters of a code, up to a zero byte.
std::string
CodeText(uint32 code)
{
	const char characters[] = {char(code >> 24), char(code >> 16), char(code >> 8), char(code), 0};
	return characters;
}


/// A number as "int32(0x1f or 31)", as wide in hexadecimal digits as it is.
template <typename Number, typename Unsigned>
std::string
NumberText(const char* word, Number number)
{
	return Format("%s(0x%llx or ", word, (unsigned long long)Unsigned(number))
		+ std::to_string(number) + ")";
}


/// A byte as "int8(0x61 or 97 or 'a')".
std::string
ByteText(const char* word, int value)
{
	const int byte = value & 0xff;
	return Format("%s(0x%x or %d or '%c')", word, byte, value, isprint(byte) != 0 ? byte : '.');
}


std::string
RefText(const entry_ref& ref)
{
	const BPath path(&ref);
	return Format("entry_ref(device=%d, directory=%lld, name=\"%s\", path=\"%s\")", int(ref.device),
		(long long)ref.directory, ref.name != nullptr ? ref.name : "",
		path.Path() != nullptr ? path.Path() : "");
}


/// The value of one item; empty for the types without a form of their own, and for an item that is
/// not of its type's form.
std::string
ItemText(const BMessage& message, const char* name, type_code type, int32 index)
{
	switch (type) {
		case B_BOOL_TYPE:
			if (!message.HasBool(name, index))
				return {};
			return message.FindBool(name, index) ? "bool(true)" : "bool(false)";

		case B_INT8_TYPE:
			if (!message.HasInt8(name, index))
				return {};
			return ByteText("int8", message.FindInt8(name, index));

		case B_UINT8_TYPE:
			if (!message.HasUInt8(name, index))
				return {};
			return ByteText("uint8", message.GetUInt8(name, index, 0));

		case B_INT16_TYPE:
			if (!message.HasInt16(name, index))
				return {};
			return NumberText<int16, uint16>("int16", message.FindInt16(name, index));

		case B_UINT16_TYPE:
			if (!message.HasUInt16(name, index))
				return {};
			return NumberText<uint16, uint16>("uint16", message.GetUInt16(name, index, 0));

		case B_INT32_TYPE:
			if (!message.HasInt32(name, index))
				return {};
			return NumberText<int32, uint32>("int32", message.FindInt32(name, index));

		case B_UINT32_TYPE:
			if (!message.HasUInt32(name, index))
				return {};
			return NumberText<uint32, uint32>("uint32", message.GetUInt32(name, index, 0));

		case B_INT64_TYPE:
			if (!message.HasInt64(name, index))
				return {};
			return NumberText<int64, uint64>("int64", message.FindInt64(name, index));

		case B_UINT64_TYPE:
			if (!message.HasUInt64(name, index))
				return {};
			return NumberText<uint64, uint64>("uint64", message.GetUInt64(name, index, 0));

		case B_FLOAT_TYPE:
			if (!message.HasFloat(name, index))
				return {};
			return Format("float(%.4f)", message.FindFloat(name, index));

		case B_DOUBLE_TYPE:
			if (!message.HasDouble(name, index))
				return {};
			return Format("double(%.8f)", message.FindDouble(name, index));

		case B_STRING_TYPE:
		{
			const char* text = message.FindString(name, index);
			if (text == nullptr)
				return {};
			return "string(\"" + std::string(text)
				+ Format("\", %zu bytes)", std::char_traits<char>::length(text) + 1);
		}

		case B_RECT_TYPE:
		{
			BRect rect;
			if (message.FindRect(name, index, &rect) != B_OK)
				return {};
			return Format("BRect(l:%.1f, t:%.1f, r:%.1f, b:%.1f)", rect.left, rect.top, rect.right,
				rect.bottom);
		}

		case B_POINT_TYPE:
		{
			BPoint point;
			if (message.FindPoint(name, index, &point) != B_OK)
				return {};
			return Format("BPoint(x:%f, y:%f)", point.x, point.y);
		}

		case B_RGB_COLOR_TYPE:
		{
			rgb_color color;
			if (message.FindColor(name, index, &color) != B_OK)
				return {};
			return Format(
				"rgb_color(%d, %d, %d, %d)", color.red, color.green, color.blue, color.alpha);
		}

		case B_REF_TYPE:
		{
			entry_ref ref;
			if (message.FindRef(name, index, &ref) != B_OK)
				return {};
			return RefText(ref);
		}

		default:
			return {};
	}
}

} // namespace


void
BMessage::PrintToStream() const
{
	// In one piece, whatever other threads print.
	flockfile(stdout);
	PrintIndented(0);
	fflush(stdout);
	funlockfile(stdout);
}


/// The message's lines, the first one where the line stands. \a depth: how many messages are around it.
void
BMessage::PrintIndented(int32 depth) const
{
	const std::string code =
		isprint(what >> 24) != 0 ? "'" + CodeText(what) + "'" : Format("0x%x", what);
	printf("BMessage(%s) {\n", code.c_str());

	const std::string indent((depth + 1) * kIndent, ' ');
	for (int32 i = 0; i < CountFields(); i++) {
		const Field& field = fBody->Fields()[i];
		const char* name = fBody->NameOf(field);
		for (uint32 k = 0; k < field.count; k++) {
			fputs((indent + name).c_str(), stdout);
			if (field.count > 1)
				printf("[%u]", k);
			fputs(" = ", stdout);

			BMessage nested;
			if (field.type == B_MESSAGE_TYPE && depth < kMaxNesting
				&& FindMessage(name, int32(k), &nested) == B_OK) {
				nested.PrintIndented(depth + 1);
				continue;
			}

			std::string text = ItemText(*this, name, field.type, int32(k));
			if (text.empty()) {
				const uint8* data;
				uint32 size;
				FindItem(i, int32(k), &data, &size);
				text = Format("(type = '%s')(size = %u)", CodeText(field.type).c_str(), size);
			}
			puts(text.c_str());
		}
	}
	printf("%s}\n", std::string(depth * kIndent, ' ').c_str());
}
