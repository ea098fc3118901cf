// SPDX-License-Identifier: MIT
// What tests of forms share: an application without a display, and components to place.

#pragma once

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "designer/DesignForm.h"
#include "designer/DesignFormView.h"
#include "support/TemporaryFolder.h"

class TPaletteEntry;

/// Tests with forms that are never shown, the standard components, and these classes for tests:
/// "TNone", whose entry makes no component, and "TTracer", which keeps data of its own in documents.
class DesignerTest : public testing::Test {
protected:
	static void SetUpTestSuite();

	DesignerTest();
	~DesignerTest();

	/// A new, hidden form, closed at the end of the test.
	TDesignForm* NewForm(const char* name = "Form1");

	/// Places a component on a form, inside \a parent when there is one.
	static TComponent* Place(TDesignForm* form, const char* className, const char* name,
		BRect frame = BRect(10, 10, 60, 40), TComponent* parent = nullptr);

	/// The form's component of that name; null when there is none.
	static TComponent* Find(TDesignForm* form, const char* name);

	/// Saves or loads, and returns what was printed.
	std::string Save(TDesignForm* form, const std::string& path);
	std::string Load(TDesignForm* form, const std::string& path, TLoadReport* report = nullptr);

	TemporaryFolder fFolder;
	bool fResult = false;

private:
	std::vector<TDesignForm*> fForms;
};
