// SPDX-License-Identifier: MIT
// The statements that set properties, and the handlers of events, as standard C++.

#include "codegen/StandardStatement.h"

#include <string.h>

#include <string_view>

#include "codegen/HandlerNames.h"
#include "codegen/SourceParts.h"
#include "codegen/SourceText.h"
#include "codegen/StandardText.h"
#include "model/ColorText.h"
#include "model/Event.h"
#include "model/Property.h"
#include "props/RGBColorProperty.h"

namespace {

constexpr const char* kMayStayUnused = "[[maybe_unused]] ";


/// The property's value as source text, but for the quotes of a text.
BString
SourceValue(const TProperty& property)
{
	BString value(property.Value(), TPropertyText::kSize);
	// No flags at all are no text.
	if (value.IsEmpty() && strcmp(property.Name(), "Flags") == 0)
		return BString("0");
	if (value.IsEmpty() || dynamic_cast<TRGBColorProperty*>(property.Editor()) == nullptr)
		return value;

	// A colour may leave channels out, and have numbers that are too large for one.
	char text[kColorTextSize];
	rgb_color color = {0, 0, 0, 0};
	return BString(RGBColorToStr(StrToRGBColor(value.String(), &color), text));
}


/// Whether the property is set by its standard statement, and not by one of its own.
bool
HasStandardStatement(const TProperty& property)
{
	return !property.HasSetStatement()
		&& property.SetStatement() == property.TProperty::SetStatement();
}


/// Marks each of \a parameters as one that the function may leave unused.
BString
MarkedParameters(const BString& parameters)
{
	BString marked;
	bool isNew = true;
	int32 depth = 0;
	TSourceParts parts(std::string_view(parameters.String(), parameters.Length()));
	source_part part;
	while (parts.Next(&part)) {
		for (const char byte : part.text) {
			if (isNew && strchr(" \t\n", byte) == nullptr) {
				// An ellipsis takes no attribute.
				if (byte != '.')
					marked << kMayStayUnused;
				isNew = false;
			}
			marked.Append(byte, 1);
			if (part.kind != SOURCE_CODE)
				continue;
			if (strchr("([{<", byte) != nullptr)
				depth++;
			else if (strchr(")]}>", byte) != nullptr)
				depth--;
			else if (byte == ',' && depth == 0)
				isNew = true;
		}
	}
	return marked;
}


bool
HasParameters(const BString& parameters)
{
	BString text(parameters);
	text.Trim();
	return !text.IsEmpty() && text != "void";
}

} // namespace


BString
StandardSetStatement(const TProperty& property, const char* object)
{
	const BString value = SourceValue(property);
	if (value.IsEmpty() && !property.IsQuoted())
		return BString();

	const std::string_view text(value.String(), value.Length());
	if (!HasStandardStatement(property)) {
		BString statement = property.SetStatement();
		IndentContinuationLines(statement);
		return FilledStatement(
			std::string_view(statement.String(), statement.Length()), object, text);
	}

	BString statement(object);
	statement << "->Set" << property.Name() << "("
			  << (property.IsQuoted() ? StringLiteral(text) : PlainSource(text)) << ");";
	return statement;
}


BString
StandardHandlerStart(const TEvent& event, const char* className, const char* name)
{
	const BString parameters = PlainParameters(event);
	const BString marked =
		HasParameters(parameters) ? MarkedParameters(parameters) : BString("void");
	return HandlerStart(
		TEvent(event.name, marked.String(), event.returnType, true), className, name);
}


BString
StandardHandlerBody(const TEvent& event, const char* baseClass)
{
	if (event.returnType == nullptr)
		return HandlerBody(event);

	BString text("$TAB");
	text << event.returnType << " result";
	if (baseClass != nullptr && strcmp(event.name, "OnQuitRequested") == 0)
		text << " = " << baseClass << "::" << HandlerName(event) << "();\n\n";
	else
		text << "{};\n\n";
	text << "$TABreturn result;\n";
	return text;
}


BString
PlainParameters(const TEvent& event)
{
	return PlainSource(event.parameters != nullptr ? event.parameters : "");
}
