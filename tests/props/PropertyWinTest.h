// SPDX-License-Identifier: MIT
// What the tests of the property window share: the window, a form to edit, and a component that watches.

#pragma once

#include <cstring>
#include <memory>
#include <string>
#include <vector>

#include <ListView.h>

#include "WindowTest.h"
#include "app/Preferences.h"
#include "app/WindowGuard.h"
#include "props/PropertyListItem.h"
#include "props/PropertyWin.h"
#include "support/LatestValues.h"

/// Notes in which order an edit asks and tells it.
class WatchfulControl : public PlainControl {
public:
	using PlainControl::PlainControl;

	bool PropertyModified(const char* name, const char* oldValue, const char* newValue) override
	{
		notes.push_back(std::string("asked ") + name + " " + oldValue + ">" + newValue + " has "
			+ FindProperty(name)->Value());
		return PlainControl::PropertyModified(name, oldValue, newValue);
	}

	void SetPropertyValue(const char* name, const char* value) override
	{
		notes.push_back(std::string("told ") + name + " " + value + " has "
			+ (FindProperty(name) != nullptr ? FindProperty(name)->Value() : ""));
		PlainControl::SetPropertyValue(name, value);
		if (strcmp(name, "Left") == 0)
			FindProperty("Top")->Editor()->SetValue("77", true);
	}

	std::vector<std::string> notes;
};


class PropertyWinTest : public WindowTest {
protected:
	void SetUp() override
	{
		AppSettings.LeaveFileAlone();
		AppSettings.MakeEmpty();
		surface = new SurfaceWindow;
		control = std::make_unique<WatchfulControl>(surface->surface);
		surface->Show();
		window = new PropertyWin;
		window->Show();
		ASSERT_TRUE(robot.WaitForWindow("Properties"));
	}

	void TearDown() override
	{
		{
			WindowGuard guard(window);
			window->SetComponent(nullptr);
			window->SetDesignView(nullptr);
		}
		QuitWindow(surface);
		QuitWindow(window);
		control.reset();
	}

	void ShowControl() { Show(control.get(), surface->surface); }

	void Show(TComponent* component, BView* designView)
	{
		{
			WindowGuard guard(window);
			ASSERT_TRUE(guard.IsLocked());
			window->SetComponent(component);
			window->SetDesignView(designView);
		}
		robot.Settle();
	}

	/// Another component beside the control. Make the window forget it before it goes.
	std::unique_ptr<PlainControl> NewComponent(const char* name)
	{
		WindowGuard guard(surface);
		return std::make_unique<PlainControl>(surface->surface, name);
	}

	BListView* List(const char* name) { return dynamic_cast<BListView*>(window->FindView(name)); }

	int32 RowOf(const char* property)
	{
		WindowGuard guard(window);
		BListView* list = List("lvProperties");
		for (int32 i = 0; i < list->CountItems(); i++) {
			const auto* row = static_cast<TPropertyListItem*>(list->ItemAt(i));
			if (strcmp(row->Name(), property) == 0)
				return i;
		}
		return -1;
	}

	std::string ShownValue(const char* property)
	{
		WaitForLatestValues(window, robot);
		const int32 row = RowOf(property);
		WindowGuard guard(window);
		auto* item = static_cast<TPropertyListItem*>(List("lvProperties")->ItemAt(row));
		return item != nullptr ? item->DisplayValue() : "?";
	}

	/// The middle of a list's row, in the window's coordinates; the list is scrolled to it.
	BPoint PlaceOf(const char* listName, int32 row)
	{
		WindowGuard guard(window);
		BListView* list = List(listName);
		list->ScrollTo(row);
		const BRect frame = list->ItemFrame(row);
		BPoint place(frame.left + 20, (frame.top + frame.bottom) / 2);
		list->ConvertToScreen(&place);
		return window->ConvertFromScreen(place);
	}

	void Select(const char* property)
	{
		robot.Click(PlaceOf("lvProperties", RowOf(property)));
		robot.Settle();
	}

	void Invoke(const char* property)
	{
		robot.Click(PlaceOf("lvProperties", RowOf(property)), 2);
		robot.Settle();
	}

	/// Types \a text in place of what the shown string pane has, and presses Enter.
	void Enter(const char* text)
	{
		robot.ClickView("efStringEdit");
		robot.Key("command+a");
		robot.Type(text);
		robot.Key("enter");
		robot.Settle();
	}

	std::string Value(const char* name)
	{
		WindowGuard guard(surface);
		return control->Value(name);
	}

	bool IsShown(const char* view)
	{
		robot.Settle();
		WindowGuard guard(window);
		return !window->FindView(view)->IsHidden();
	}

	std::string FocusName()
	{
		robot.Settle();
		WindowGuard guard(window);
		BView* focus = window->CurrentFocus();
		while (focus != nullptr && focus->Name() != nullptr && strncmp(focus->Name(), "_", 1) == 0)
			focus = focus->Parent();
		return focus != nullptr && focus->Name() != nullptr ? focus->Name() : "";
	}

	SurfaceWindow* surface = nullptr;
	PropertyWin* window = nullptr;
	std::unique_ptr<WatchfulControl> control;
	Robot robot;
};
