// SPDX-License-Identifier: MIT
// Finds what would keep a project's generated sources from compiling.

#include "codegen/ProjectCheck.h"

#include <ctype.h>

#include <algorithm>

#include "codegen/FormParts.h"
#include "codegen/HandlerNames.h"
#include "codegen/StandardText.h"
#include "designer/DesignForm.h"
#include "model/AppComponent.h"
#include "model/Event.h"

namespace {

const std::unordered_set<std::string_view> kKeywords = {"alignas", "alignof", "and", "and_eq",
	"asm", "auto", "bitand", "bitor", "bool", "break", "case", "catch", "char", "char16_t",
	"char32_t", "char8_t", "class", "co_await", "co_return", "co_yield", "compl", "concept",
	"const", "const_cast", "consteval", "constexpr", "constinit", "continue", "decltype", "default",
	"delete", "do", "double", "dynamic_cast", "else", "enum", "explicit", "export", "extern",
	"false", "float", "for", "friend", "goto", "if", "inline", "int", "long", "mutable",
	"namespace", "new", "noexcept", "not", "not_eq", "nullptr", "operator", "or", "or_eq",
	"private", "protected", "public", "register", "reinterpret_cast", "requires", "return", "short",
	"signed", "sizeof", "static", "static_assert", "static_cast", "struct", "switch", "template",
	"this", "thread_local", "throw", "true", "try", "typedef", "typeid", "typename", "union",
	"unsigned", "using", "virtual", "void", "volatile", "wchar_t", "while", "xor", "xor_eq"};

/// Names that the generated code of a form uses or declares inside the form's class.
const char* const kFormMembers[] = {"_formInit", "BMessage", "BRect", "FormCreate", "FormDestroy",
	"FormView", "MessageReceived", "SetFormView", "TForm", "TFormView"};

/// The same of the application class.
const char* const kAppMembers[] = {
	"APP_SIG", "BApplication", "BMessage", "MainForm", "MessageReceived", "TForm", "m_MainForm"};

/// Classes that generated code takes from the runtime library.
const char* const kRuntimeClasses[] = {"TForm", "TFormView"};
const char* const kRuntimeLibrary = "the runtime library";
const char* const kGeneratedClass = "the generated class";


bool
IsWordByte(char c)
{
	return c == '_' || (c >= '0' && c <= '9') || (c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z');
}


bool
IsWord(std::string_view text)
{
	return !text.empty() && std::all_of(text.begin(), text.end(), IsWordByte);
}


std::string
Quoted(const std::string& text)
{
	return "'" + text + "'";
}


std::string
LowerCase(std::string text)
{
	std::transform(text.begin(), text.end(), text.begin(),
		[](unsigned char c) { return static_cast<char>(c < 0x80 ? tolower(c) : c); });
	return text;
}


bool
IsAscii(const char* text)
{
	for (; *text != '\0'; text++) {
		if (static_cast<unsigned char>(*text) >= 0x80)
			return false;
	}
	return true;
}


/// Whether every bracket in \a text is closed by its own kind.
bool
IsBalanced(const char* text)
{
	std::string open;
	for (; *text != '\0'; text++) {
		if (*text == '(')
			open += ')';
		else if (*text == '[')
			open += ']';
		else if (*text == '{')
			open += '}';
		else if (*text == ')' || *text == ']' || *text == '}') {
			if (open.empty() || open.back() != *text)
				return false;
			open.pop_back();
		}
	}
	return open.empty();
}


/// Whether "TYPE result;" declares a variable that can then be returned.
bool
IsReturnable(std::string_view type)
{
	while (!type.empty() && isspace(static_cast<unsigned char>(type.back())))
		type.remove_suffix(1);
	if (type.empty() || type == "void" || type.back() == '&')
		return false;
	const bool isPointer = type.find('*') != std::string_view::npos;
	return isPointer || type.substr(0, 6) != "const ";
}


/// The path of the form's document, or its name when it was never saved.
std::string
FormFileText(TDesignForm* form)
{
	const char* path = form->Filename();
	return path != nullptr && path[0] != '\0' ? path : form->ComponentName();
}

} // namespace


std::string
TProjectCheck::name_owner::Text() const
{
	std::string text;
	if (event != nullptr)
		text.append("the event ").append(event).append(" of ");
	text += kind;
	return name != nullptr ? text + " " + Quoted(name) : text;
}


TProjectCheck::TProjectCheck(
	const TAppComponent* app, const char* projectFile, source_dialect dialect)
	: fApp(app),
	  fProjectFile(projectFile),
	  fDialect(dialect)
{
}


const std::vector<project_problem>&
TProjectCheck::Run()
{
	for (const char* name : kRuntimeClasses)
		fClasses.emplace(name, name_owner{kRuntimeLibrary, nullptr});

	CheckApp();
	for (int32 i = 0; i < fApp->CountComponents(); i++) {
		TDesignForm* form = FormAt(fApp, i);
		if (form != nullptr)
			CheckForm(form);
	}
	return fProblems;
}


void
TProjectCheck::CheckApp()
{
	fFile = fProjectFile;
	const std::string name = fApp->ComponentName();
	const name_owner owner = {"the application", fApp->ComponentName()};
	CheckIdentifier(name.c_str(), owner);
	fFiles.emplace(name, owner);
	ClaimName(fClasses, "T" + name, owner, "class");

	fMembers.clear();
	fHandlers.clear();
	for (const char* member : kAppMembers)
		fMembers.emplace(member, name_owner{kGeneratedClass, nullptr});
	for (int32 i = 0; i < fApp->CountEvents(); i++) {
		const TEvent* event = fApp->EventAt(i);
		if (IsSelected(event))
			CheckHandler(*event, HandlerName(*event).String(), owner);
	}
}


void
TProjectCheck::CheckForm(TDesignForm* form)
{
	fFile = FormFileText(form);
	CheckFormFile(form);
	CheckFormClasses(form);

	fMembers.clear();
	fHandlers.clear();
	// Most components have one handler.
	const size_t count = static_cast<size_t>(FormComponents(form)->CountComponents());
	fMembers.reserve(2 * count);
	fHandlers.reserve(count);
	for (const char* member : kFormMembers)
		fMembers.emplace(member, name_owner{kGeneratedClass, nullptr});
	const std::string className = std::string("T") + form->ComponentName();
	fMembers.emplace(className, name_owner{"the form's class", nullptr});
	fMembers.emplace(className + "View", name_owner{"the form's view class", nullptr});
	CheckComponentNames(form);
	CheckHandlers(form);
}


void
TProjectCheck::CheckFormFile(TDesignForm* form)
{
	const std::string name = form->ComponentName();
	const name_owner owner = {"the form", form->ComponentName()};
	CheckIdentifier(name.c_str(), owner);

	char buffer[kGeneratedNameSize];
	const std::string file = BaseFormFilename(form, buffer);
	// Where the sources are named after the form's file, that name guards the header.
	if (file != name && !IsWord(file)) {
		Report("the file's name " + Quoted(file)
			+ " cannot be part of a C++ identifier, as its include guard needs; rename the file");
	}
	ClaimName(fFiles, file, owner, "files");
}


void
TProjectCheck::CheckFormClasses(TDesignForm* form)
{
	const std::string name = form->ComponentName();
	const name_owner owner = {"the form", form->ComponentName()};
	ClaimName(fClasses, "T" + name, owner, "class");
	ClaimName(fClasses, "T" + name + "View", owner, "class");
}


void
TProjectCheck::CheckComponentNames(TDesignForm* form)
{
	const TComponentOwner* components = FormComponents(form);
	const int32 count = components->CountComponents();
	std::unordered_set<std::string> classes;
	for (int32 i = 0; i < count; i++) {
		const TComponent* component = components->ComponentAt(i);
		if (classes.insert(component->ClassName()).second)
			CheckComponentClass(component);
	}
	for (int32 i = 0; i < count; i++) {
		const TComponent* component = components->ComponentAt(i);
		const name_owner owner = {"the component", component->ComponentName()};
		CheckIdentifier(component->ComponentName(), owner);
		ClaimName(fMembers, component->ComponentName(), owner, "member");
	}
}


void
TProjectCheck::CheckComponentClass(const TComponent* component)
{
	const std::string className = component->ClassName();
	// A member cannot be called like the class of another member.
	fMembers.emplace(className, name_owner{"the components' class", component->ClassName()});
	if (!IsIdentifier(className)) {
		const name_owner owner = {"the component", component->ComponentName()};
		Report("the class name " + Quoted(className) + " of " + owner.Text()
			+ " is no C++ identifier; correct its component library");
	}
	const auto clash = fClasses.find(className);
	if (clash != fClasses.end() && clash->second.kind != kRuntimeLibrary) {
		Report("the components' class " + Quoted(className) + " is also the class of "
			+ clash->second.Text() + "; rename that");
	}
}


void
TProjectCheck::CheckHandlers(TDesignForm* form)
{
	for (int32 i = 0; i < form->CountEvents(); i++) {
		const TEvent* event = form->EventAt(i);
		if (IsSelected(event))
			CheckHandler(*event, HandlerName(*event).String(), {"the form", form->ComponentName()});
	}

	const TComponentOwner* components = FormComponents(form);
	for (int32 i = 0; i < components->CountComponents(); i++) {
		TComponent* component = components->ComponentAt(i);
		for (int32 j = 0; j < component->CountEvents(); j++) {
			const TEvent* event = component->EventAt(j);
			if (IsSelected(event))
				CheckHandler(*event, HandlerName(*component, *event).String(),
					{"the component", component->ComponentName()});
		}
	}
}


void
TProjectCheck::CheckHandler(
	const TEvent& event, const std::string& name, const name_owner& eventOwner)
{
	const name_owner owner = {eventOwner.kind, eventOwner.name, event.name};
	const auto handler = [&] { return "the handler " + Quoted(name) + " of " + owner.Text(); };
	if (!IsIdentifier(name))
		Report(handler() + " is no C++ identifier; rename the component or switch the event off");

	BString parameters(event.parameters);
	if (fDialect == DIALECT_STANDARD)
		parameters = PlainSource(parameters.String());
	if (!IsAscii(parameters.String()))
		Report(handler()
			+ " would not compile: its parameters hold characters that are no plain ASCII"
			+ " (such as non-breaking spaces); switch the event off");
	else if (!IsBalanced(parameters.String()))
		Report(handler() + " would not compile: the brackets of its parameters do not match;"
			+ " switch the event off");
	if (event.returnType != nullptr
		&& (!IsAscii(event.returnType) || !IsReturnable(event.returnType)))
		Report(handler() + " would not compile: it cannot return " + Quoted(event.returnType)
			+ "; switch the event off");

	const size_t before = fProblems.size();
	ClaimName(fMembers, name, owner, "member");
	// An existing source is searched without regard to case: one handler would stand for both.
	const auto claimed = fHandlers.emplace(LowerCase(name), owner);
	if (!claimed.second && fProblems.size() == before)
		Report("the handlers of " + claimed.first->second.Text() + " and of " + owner.Text()
			+ " differ in the case of letters only; rename a component");
}


void
TProjectCheck::CheckIdentifier(const char* name, const name_owner& owner)
{
	if (!IsIdentifier(name))
		Report("the name of " + owner.Text() + " is no C++ identifier; rename it");
}


/// Gives \a name to \a owner, unless another one has it already, which is a problem.
void
TProjectCheck::ClaimName(
	name_owners& owners, const std::string& name, const name_owner& owner, const char* kind)
{
	const auto claimed = owners.emplace(name, owner);
	if (!claimed.second)
		Report(claimed.first->second.Text() + " and " + owner.Text() + " would both have the "
			+ kind + " " + Quoted(name) + "; rename one of them");
}


void
TProjectCheck::Report(const std::string& text)
{
	fProblems.push_back({fFile, text});
}


bool
IsIdentifier(std::string_view name)
{
	return IsWord(name) && !(name[0] >= '0' && name[0] <= '9') && kKeywords.count(name) == 0;
}
