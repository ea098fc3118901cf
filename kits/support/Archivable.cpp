// SPDX-License-Identifier: MIT
// BArchivable, and making objects from archives.

#include <Archivable.h>

#include <cxxabi.h>
#include <stdlib.h>
#include <string.h>

#include <memory>
#include <string>
#include <string_view>
#include <typeinfo>

#include <Message.h>

namespace {

constexpr const char* kClassField = "class";


std::string
class_name(const std::type_info& type)
{
	int status;
	std::unique_ptr<char, decltype(&free)> name(
		abi::__cxa_demangle(type.name(), nullptr, nullptr, &status), &free);
	return status == 0 ? name.get() : type.name();
}


/// The linker's name of the class's Instantiate(BMessage*).
std::string
instantiate_symbol(std::string_view className)
{
	std::string symbol = "_ZN";
	while (!className.empty()) {
		std::string_view part = className.substr(0, className.find("::"));
		className.remove_prefix(std::min(part.size() + 2, className.size()));
		symbol += std::to_string(part.size());
		symbol += part;
	}
	return symbol + "11InstantiateEP8BMessage";
}


/// Looks into every image: what add-ons define is seen by none of the others.
instantiation_func
find_function(const char* className, image_id* image)
{
	*image = B_BAD_VALUE;
	if (className == nullptr || className[0] == '\0')
		return nullptr;

	std::string symbol = instantiate_symbol(className);
	int32 cookie = 0;
	image_info info;
	while (get_next_image_info(B_CURRENT_TEAM, &cookie, &info) == B_OK) {
		void* function;
		if (get_image_symbol(info.id, symbol.c_str(), B_SYMBOL_TYPE_TEXT, &function) != B_OK)
			continue;
		*image = info.id;
		return reinterpret_cast<instantiation_func>(function);
	}
	*image = B_ENTRY_NOT_FOUND;
	return nullptr;
}


/// By the archive's class names, the most derived first.
instantiation_func
find_function(BMessage* archive, image_id* image)
{
	*image = B_BAD_VALUE;
	if (archive == nullptr)
		return nullptr;

	const char* name;
	for (int32 i = 0; archive->FindString(kClassField, i, &name) == B_OK; i++) {
		instantiation_func function = find_function(name, image);
		if (function != nullptr)
			return function;
	}
	return nullptr;
}

} // namespace


BArchivable::BArchivable() {}


BArchivable::BArchivable(BMessage*) {}


BArchivable::~BArchivable() {}


status_t
BArchivable::Archive(BMessage* into, bool) const
{
	if (into == nullptr)
		return B_BAD_VALUE;
	if (into->HasString(kClassField))
		return B_OK;
	return into->AddString(kClassField, class_name(typeid(*this)).c_str());
}


BArchivable*
BArchivable::Instantiate(BMessage*)
{
	return nullptr;
}


BArchivable*
instantiate_object(BMessage* from, image_id* id)
{
	image_id image;
	instantiation_func function = find_function(from, &image);
	if (id != nullptr)
		*id = image;
	return function == nullptr ? nullptr : function(from);
}


BArchivable*
instantiate_object(BMessage* from)
{
	return instantiate_object(from, nullptr);
}


bool
validate_instantiation(BMessage* from, const char* className)
{
	if (from == nullptr || className == nullptr)
		return false;

	const char* name;
	for (int32 i = 0; from->FindString(kClassField, i, &name) == B_OK; i++) {
		if (strcmp(name, className) == 0)
			return true;
	}
	return false;
}


instantiation_func
find_instantiation_func(const char* className, const char*)
{
	return find_instantiation_func(className);
}


instantiation_func
find_instantiation_func(const char* className)
{
	image_id image;
	return find_function(className, &image);
}


instantiation_func
find_instantiation_func(BMessage* archive)
{
	image_id image;
	return find_function(archive, &image);
}
