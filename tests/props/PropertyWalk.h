// SPDX-License-Identifier: MIT
// Goes through all properties of a component in the property window, and edits each as a user does.

#pragma once

#include <map>
#include <set>
#include <string>
#include <vector>

#include "PropertyWinTest.h"

class TDesignForm;

/// How the properties of one round are edited.
enum class Hand { kMouse, kKeys };

/// The property window beside a shown form.
class PropertyWalk : public PropertyWinTest {
protected:
	using Values = std::map<std::string, std::string>;

	void SetUp() override;
	void TearDown() override;

	/// Puts a new form in the place of the one before.
	void RenewForm();

	/// A form of its own with the content of the file, which stands where the form stood.
	TDesignForm* Load(const char* path);
	void Close(TDesignForm* closed);

	/// Makes a component of that class on the form.
	TComponent* Place(const char* className, BRect frame);

	/// Edits every property, and checks after each that the property, the store, the window's row and the design-time
	/// view have the new value. \a round makes the values differ: 1, 2, ...
	void EditAll(TComponent* component, Hand hand, int round);

	/// The values of all properties.
	static Values ValuesOf(TComponent* component);

	WindowPicture PictureOf(TDesignForm* shown);
	/// Whether two forms have the same content.
	static bool LooksLike(const WindowPicture& one, const WindowPicture& other);

	TDesignForm* form = nullptr;
	/// The properties whose edits were found again in the design-time view or changed how the form looks.
	std::set<std::string> seen;

private:
	void ShowOnForm(TComponent* component);
	std::string ValueOf(TComponent* component, const std::string& name);
	std::string StoredValueOf(TComponent* component, const std::string& name);
	std::vector<std::string> ChoicesOf(TComponent* component, const std::string& name);
	void Edit(TComponent* component, const std::string& name, Hand hand, int round);
	bool ExpectInView(TComponent* component, const std::string& name, const std::string& value);
	void WaitForEndOf(const std::string& dialog);

	std::string EditByMouse(TComponent* component, const std::string& name, int round);
	std::string EditByKeys(TComponent* component, const std::string& name, int round);
	std::string NewText(TComponent* component, const std::string& name, int round);
	std::string NextChoice(TComponent* component, const std::string& name, size_t* index);
};
