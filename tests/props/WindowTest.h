// SPDX-License-Identifier: MIT
// What the tests of the property window and its dialogs share: an application, a form to edit, a robot.

#pragma once

#include <memory>
#include <string>

#include <gtest/gtest.h>

#include <Application.h>
#include <View.h>
#include <Window.h>

#include "model/ControlComponent.h"
#include "model/Property.h"
#include "props/PropertyEditor.h"
#include "support/Robot.h"

extern "C" int32 be_count_lock_violations();

/// Tests with windows: no thread may hold the locks of two of them.
class WindowTest : public testing::Test {
protected:
	~WindowTest() { EXPECT_EQ(be_count_lock_violations(), 0); }

	BApplication application{"application/x-qtx.PropsTest"};
};


inline void
QuitWindow(BWindow* window)
{
	if (window->Lock())
		window->Quit();
}


/// A shown window with the view of one component, in place of a design form.
class SurfaceWindow : public BWindow {
public:
	SurfaceWindow()
		: BWindow(BRect(500, 100, 799, 299), "Surface", B_TITLED_WINDOW, 0),
		  surface(new BView(Bounds(), "surface", B_FOLLOW_ALL_SIDES, B_WILL_DRAW))
	{
		AddChild(surface);
	}

	BView* const surface;
};


/// A component with the properties and events of a control.
class PlainControl : public TControlComponent {
public:
	explicit PlainControl(BView* parent, const char* name = "Control1")
		: TControlComponent(nullptr, nullptr)
	{
		SetComponentName(name);
		SetClassName("TPlain");
		BView* view = new BView(BRect(10, 10, 109, 59), name, B_FOLLOW_NONE, B_WILL_DRAW);
		if (parent != nullptr)
			parent->AddChild(view);
		SetDTView(view);
		InitPropertyList();
		InitEventList();
		InitPropertyValues();
		InitEventValues();
		SetPropertyValue("Name", name);
	}

	bool PropertyModified(const char* name, const char* oldValue, const char* newValue) override
	{
		return !refuses && TControlComponent::PropertyModified(name, oldValue, newValue);
	}

	std::string Value(const char* name) { return FindProperty(name)->Value(); }

	bool refuses = false;
};
