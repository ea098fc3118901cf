// SPDX-License-Identifier: MIT
// The text form of messages in the samples.

#include "kits/app/MessageText.h"

#include <cmath>
#include <cstring>
#include <fstream>
#include <iterator>
#include <sstream>
#include <vector>

#include <Message.h>
#include <Point.h>
#include <gtest/gtest.h>

namespace {

std::string
Formatted(const char* format, double value)
{
	char text[64];
	snprintf(text, sizeof(text), format, value);
	return text;
}


std::string
CodeText(uint32 code)
{
	char characters[] = {char(code >> 24), char(code >> 16), char(code >> 8), char(code)};
	for (char character : characters) {
		if (character < 0x20 || character > 0x7e || character == '\'' || character == '\\') {
			char text[16];
			snprintf(text, sizeof(text), "0x%08x", code);
			return text;
		}
	}
	return "'" + std::string(characters, 4) + "'";
}


std::string
Quoted(const std::string& value)
{
	std::string text = "\"";
	for (unsigned char byte : value) {
		if (byte == '"' || byte == '\\') {
			text += '\\';
			text += char(byte);
		} else if (byte == '\n') {
			text += "\\n";
		} else if (byte == '\t') {
			text += "\\t";
		} else if (byte < 0x20 || byte > 0x7e) {
			char escape[8];
			snprintf(escape, sizeof(escape), "\\x%02x", byte);
			text += escape;
		} else {
			text += char(byte);
		}
	}
	return text + "\"";
}


std::string
FloatText(float value)
{
	return Formatted("%.9g", value);
}


void WriteMessage(const BMessage& message, int indent, std::string* text);


/// The item in its plain form; empty when it has none.
std::string
PlainItem(const BMessage& message, const char* name, type_code type, int32 i, int indent)
{
	switch (type) {
		case B_BOOL_TYPE:
		{
			const void* data;
			ssize_t size;
			message.FindData(name, type, i, &data, &size);
			if (size != 1 || *static_cast<const uint8*>(data) > 1)
				return {};
			return message.FindBool(name, i) ? "bool true" : "bool false";
		}

		case B_INT8_TYPE:
			if (!message.HasInt8(name, i))
				return {};
			return "int8 " + std::to_string(message.FindInt8(name, i));

		case B_UINT8_TYPE:
			if (!message.HasUInt8(name, i))
				return {};
			return "uint8 " + std::to_string(message.GetUInt8(name, i, 0));

		case B_INT16_TYPE:
			if (!message.HasInt16(name, i))
				return {};
			return "int16 " + std::to_string(message.FindInt16(name, i));

		case B_UINT16_TYPE:
			if (!message.HasUInt16(name, i))
				return {};
			return "uint16 " + std::to_string(message.GetUInt16(name, i, 0));

		case B_INT32_TYPE:
			if (!message.HasInt32(name, i))
				return {};
			return "int32 " + std::to_string(message.FindInt32(name, i));

		case B_UINT32_TYPE:
			if (!message.HasUInt32(name, i))
				return {};
			return "uint32 " + std::to_string(message.GetUInt32(name, i, 0));

		case B_INT64_TYPE:
			if (!message.HasInt64(name, i))
				return {};
			return "int64 " + std::to_string(message.FindInt64(name, i));

		case B_UINT64_TYPE:
			if (!message.HasUInt64(name, i))
				return {};
			return "uint64 " + std::to_string(message.GetUInt64(name, i, 0));

		case B_FLOAT_TYPE:
		{
			float value;
			if (message.FindFloat(name, i, &value) != B_OK || !std::isfinite(value))
				return {};
			return "float " + FloatText(value);
		}

		case B_DOUBLE_TYPE:
		{
			double value;
			if (message.FindDouble(name, i, &value) != B_OK || !std::isfinite(value))
				return {};
			return "double " + Formatted("%.17g", value);
		}

		case B_POINT_TYPE:
		{
			BPoint point;
			if (message.FindPoint(name, i, &point) != B_OK || !std::isfinite(point.x)
				|| !std::isfinite(point.y)) {
				return {};
			}
			return "point " + FloatText(point.x) + " " + FloatText(point.y);
		}

		case B_RECT_TYPE:
		{
			BRect rect;
			if (message.FindRect(name, i, &rect) != B_OK || !std::isfinite(rect.left)
				|| !std::isfinite(rect.top) || !std::isfinite(rect.right)
				|| !std::isfinite(rect.bottom)) {
				return {};
			}
			return "rect " + FloatText(rect.left) + " " + FloatText(rect.top) + " "
				+ FloatText(rect.right) + " " + FloatText(rect.bottom);
		}

		case B_STRING_TYPE:
		{
			const char* value = message.FindString(name, i);
			return value != nullptr ? "string " + Quoted(value) : "";
		}

		case B_MESSAGE_TYPE:
		{
			BMessage nested;
			if (message.FindMessage(name, i, &nested) != B_OK)
				return {};
			std::string text;
			WriteMessage(nested, indent, &text);
			// Its own indentation and line end come from the caller.
			return text.substr(indent, text.size() - indent - 1);
		}

		default:
			return {};
	}
}


void
WriteMessage(const BMessage& message, int indent, std::string* text)
{
	const std::string space(indent, ' ');
	*text += space + "message " + CodeText(message.what) + "\n";

	int32 header[17];
	memcpy(header, FlatBytes(message).data(), sizeof(header));
	if (header[2] != 1 || header[3] != -1 || header[4] != -1 || header[6] != -1 || header[7] != -1
		|| header[8] != -1) {
		char line[128];
		snprintf(line, sizeof(line), "  header flags=0x%x target=%d specifier=%d reply=%d,%d,%d\n",
			unsigned(header[2]), header[3], header[4], header[6], header[7], header[8]);
		*text += space + line;
	}

	char* name;
	type_code type;
	int32 count;
	for (int32 i = 0; message.GetInfo(B_ANY_TYPE, i, &name, &type, &count) == B_OK; i++) {
		bool isFixedSize;
		if (message.GetInfo(name, &type, &isFixedSize) != B_OK)
			continue;
		*text += space + "  field " + Quoted(name) + " " + CodeText(type)
			+ (isFixedSize ? " fixed " : " variable ") + std::to_string(count) + "\n";
		for (int32 k = 0; k < count; k++) {
			std::string item = PlainItem(message, name, type, k, indent + 4);
			if (item.empty()) {
				const void* data = nullptr;
				ssize_t size = 0;
				message.FindData(name, type, k, &data, &size);
				item = "data ";
				for (ssize_t at = 0; at < size; at++) {
					char digits[4];
					snprintf(digits, sizeof(digits), "%02x", static_cast<const uint8*>(data)[at]);
					item += digits;
				}
			}
			*text += space + "    " + item + "\n";
		}
	}
}


// #pragma mark - Building


/// Takes the lines of a text one after the other, with the words in them.
class TextReader {
public:
	explicit TextReader(const std::string& text)
	{
		std::istringstream stream(text);
		std::string line;
		while (std::getline(stream, line)) {
			const size_t start = line.find_first_not_of(' ');
			if (start == line.npos || line[start] == '#')
				continue;
			fIndents.push_back(start);
			fLines.push_back(line.substr(start));
		}
		fNext = 0;
	}

	bool ReadMessage(size_t indent, BMessage* message);
	bool IsAtEnd() const { return fNext == fLines.size(); }

private:
	bool ReadField(size_t indent, BMessage* message);
	bool ReadItem(
		size_t indent, const std::string& name, type_code type, bool isFixed, BMessage* message);
	bool IsNext(size_t indent, const char* word) const
	{
		return fNext < fLines.size() && fIndents[fNext] == indent
			&& fLines[fNext].rfind(word, 0) == 0;
	}

	std::vector<size_t> fIndents;
	std::vector<std::string> fLines;
	size_t fNext;
};


bool
ParseCode(const std::string& text, uint32* code)
{
	if (text.rfind("0x", 0) == 0) {
		*code = uint32(std::stoul(text, nullptr, 16));
		return true;
	}
	if (text.size() != 6 || text.front() != '\'' || text.back() != '\'')
		return false;
	*code = 0;
	for (int i = 1; i < 5; i++)
		*code = *code << 8 | uint8(text[i]);
	return true;
}


/// Takes a quoted string off the front.
bool
TakeQuoted(std::string* text, std::string* value)
{
	if (text->empty() || text->front() != '"')
		return false;
	size_t i = 1;
	for (; i < text->size() && (*text)[i] != '"'; i++) {
		char character = (*text)[i];
		if (character == '\\') {
			character = (*text)[++i];
			if (character == 'n')
				character = '\n';
			else if (character == 't')
				character = '\t';
			else if (character == 'x') {
				character = char(std::stoul(text->substr(i + 1, 2), nullptr, 16));
				i += 2;
			}
		}
		*value += character;
	}
	if (i >= text->size())
		return false;
	*text = text->substr(i + 1);
	return true;
}


bool
TextReader::ReadMessage(size_t indent, BMessage* message)
{
	if (!IsNext(indent, "message ") || !ParseCode(fLines[fNext].substr(8), &message->what))
		return false;
	fNext++;
	while (IsNext(indent + 2, "field ")) {
		if (!ReadField(indent + 2, message))
			return false;
	}
	return true;
}


bool
TextReader::ReadField(size_t indent, BMessage* message)
{
	std::string rest = fLines[fNext++].substr(6);
	std::string name;
	if (!TakeQuoted(&rest, &name))
		return false;
	std::istringstream words(rest);
	std::string code;
	std::string flag;
	int count;
	type_code type;
	if (!(words >> code >> flag >> count) || !ParseCode(code, &type))
		return false;
	for (int i = 0; i < count; i++) {
		if (!ReadItem(indent + 2, name, type, flag == "fixed", message))
			return false;
	}
	return true;
}


bool
TextReader::ReadItem(
	size_t indent, const std::string& fieldName, type_code type, bool isFixed, BMessage* message)
{
	const char* name = fieldName.c_str();
	if (type == B_MESSAGE_TYPE && IsNext(indent, "message ")) {
		BMessage nested;
		return ReadMessage(indent, &nested) && message->AddMessage(name, &nested) == B_OK;
	}
	if (!IsNext(indent, ""))
		return false;

	std::istringstream words(fLines[fNext++]);
	std::string word;
	words >> word >> std::ws;
	std::string value{std::istreambuf_iterator<char>(words), {}};
	std::istringstream numbers(value);
	float coordinates[4] = {};
	for (float& coordinate : coordinates)
		numbers >> coordinate;

	status_t status = B_BAD_VALUE;
	if (word == "bool") {
		status = message->AddBool(name, value == "true");
	} else if (word == "int8") {
		status = message->AddInt8(name, int8(std::stol(value)));
	} else if (word == "uint8") {
		status = message->AddUInt8(name, uint8(std::stoul(value)));
	} else if (word == "int16") {
		status = message->AddInt16(name, int16(std::stol(value)));
	} else if (word == "uint16") {
		status = message->AddUInt16(name, uint16(std::stoul(value)));
	} else if (word == "int32") {
		status = message->AddInt32(name, int32(std::stol(value)));
	} else if (word == "uint32") {
		status = message->AddUInt32(name, uint32(std::stoul(value)));
	} else if (word == "int64") {
		status = message->AddInt64(name, std::stoll(value));
	} else if (word == "uint64") {
		status = message->AddUInt64(name, std::stoull(value));
	} else if (word == "float") {
		status = message->AddFloat(name, std::stof(value));
	} else if (word == "double") {
		status = message->AddDouble(name, std::stod(value));
	} else if (word == "point") {
		status = message->AddPoint(name, BPoint(coordinates[0], coordinates[1]));
	} else if (word == "rect") {
		status = message->AddRect(
			name, BRect(coordinates[0], coordinates[1], coordinates[2], coordinates[3]));
	} else if (word == "string") {
		std::string text;
		if (TakeQuoted(&value, &text))
			status = message->AddString(name, text.c_str());
	} else if (word == "data") {
		const std::string bytes = Bytes(value.c_str());
		status = message->AddData(name, type, bytes.data(), bytes.size(), isFixed);
	}

	type_code found;
	return status == B_OK && message->GetInfo(name, &found) == B_OK && found == type;
}

} // namespace


std::string
MessageText(const BMessage& message)
{
	std::string text;
	WriteMessage(message, 0, &text);
	return text;
}


bool
BuildMessage(const std::string& text, BMessage* message)
{
	TextReader reader(text);
	return reader.ReadMessage(0, message) && reader.IsAtEnd();
}


std::string
FlatBytes(const BMessage& message)
{
	std::string bytes(message.FlattenedSize(), '\0');
	EXPECT_EQ(message.Flatten(bytes.data(), ssize_t(bytes.size())), B_OK);
	return bytes;
}


std::string
ReadSample(const std::string& fileName)
{
	std::ifstream file(std::string(TEST_DATA_DIR "/samples/") + fileName, std::ios::binary);
	EXPECT_TRUE(file.good()) << fileName;
	return {std::istreambuf_iterator<char>(file), {}};
}


std::string
Bytes(const char* hexadecimal)
{
	std::string bytes;
	int digits = 0;
	int value = 0;
	for (const char* at = hexadecimal; *at != '\0'; at++) {
		if (isxdigit(*at) == 0)
			continue;
		value = value << 4 | (isdigit(*at) != 0 ? *at - '0' : (*at | 0x20) - 'a' + 10);
		if (++digits % 2 == 0) {
			bytes += char(value);
			value = 0;
		}
	}
	return bytes;
}
