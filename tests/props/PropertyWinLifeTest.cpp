// SPDX-License-Identifier: MIT
// The property window beside forms that change, forget and destroy what it shows.

#include <atomic>
#include <functional>
#include <thread>

#include <MenuField.h>
#include <MenuItem.h>
#include <OS.h>

#include "PropertyWinTest.h"
#include "model/Event.h"

namespace {

/// Does something else, too, while a property is set.
class BusyControl : public PlainControl {
public:
	using PlainControl::PlainControl;

	void SetPropertyValue(const char* name, const char* value) override
	{
		PlainControl::SetPropertyValue(name, value);
		if (onSet)
			onSet(name);
	}

	std::function<void(const char*)> onSet;
};


class PropertyWinLifeTest : public PropertyWinTest {
protected:
	std::unique_ptr<BusyControl> NewBusyControl()
	{
		WindowGuard guard(surface);
		return std::make_unique<BusyControl>(surface->surface, "Busy");
	}

	void Forget(std::unique_ptr<BusyControl>* busy)
	{
		Show(nullptr, nullptr);
		WindowGuard guard(surface);
		busy->reset();
	}

	/// Another form, behind the window, which is active.
	SurfaceWindow* NewForm()
	{
		SurfaceWindow* form = new SurfaceWindow;
		form->Show();
		robot.Settle();
		{
			WindowGuard guard(window);
			window->Activate();
		}
		robot.Settle();
		return form;
	}

	/// Sends \a what to the window and waits until it is handled.
	void Tell(uint32 what, const char* caption = nullptr)
	{
		BMessage message(what);
		if (caption != nullptr)
			message.AddString("caption", caption);
		BMessage reply;
		ASSERT_EQ(BMessenger(window).SendMessage(&message, &reply, 20000000, 20000000), B_OK);
	}
};

} // namespace

TEST_F(PropertyWinLifeTest, ARefusedPickIsDropped)
{
	ShowControl();
	Select("Enabled");
	control->refuses = true;
	EXPECT_TRUE(robot.ClickView("mfPickEdit"));
	EXPECT_TRUE(robot.ClickItem("false"));
	EXPECT_EQ(ShownValue("Enabled"), "true");
	EXPECT_EQ(Value("Enabled"), "true");
}


TEST_F(PropertyWinLifeTest, ARefreshLeavesTheOpenMenuOfChoicesAlone)
{
	ShowControl();
	Select("Enabled");
	BMenu* menu;
	{
		WindowGuard guard(window);
		menu = dynamic_cast<BMenuField*>(window->FindView("mfPickEdit"))->Menu();
	}
	EXPECT_TRUE(robot.ClickView("mfPickEdit"));
	EXPECT_TRUE(robot.WaitForWindow("mnuPickEdit"));
	const BMenuItem* first = menu->ItemAt(0);
	window->UpdateDisplayValues();
	Tell(PWM_MODAL_EDIT_FIELD);
	EXPECT_EQ(menu->ItemAt(0), first);
	EXPECT_TRUE(robot.ClickItem("false"));
	EXPECT_EQ(Value("Enabled"), "false");
}


TEST_F(PropertyWinLifeTest, AComponentMayBuildItsPropertiesAnewWhileOneIsSet)
{
	auto busy = NewBusyControl();
	busy->onSet = [&](const char* name) {
		if (strcmp(name, "Label") != 0)
			return;
		busy->ClearProperties(true);
		busy->InitPropertyList();
		busy->FindProperty("Top")->SetValue("12");
	};
	Show(busy.get(), surface->surface);
	Select("Label");
	Enter("new");
	EXPECT_EQ(ShownValue("Top"), "12");
	// The rows are those of the new properties.
	busy->onSet = nullptr;
	Select("Top");
	EXPECT_EQ(robot.Text("efStringEdit"), "12");
	Enter("34");
	EXPECT_EQ(ShownValue("Top"), "34");
	Forget(&busy);
}


TEST_F(PropertyWinLifeTest, AComponentMayHaveAnotherOneShownWhileItIsSet)
{
	auto busy = NewBusyControl();
	busy->onSet = [&](const char*) {
		WindowGuard guard(window);
		window->SetComponent(control.get());
	};
	Show(busy.get(), surface->surface);
	Select("Label");
	Enter("new");
	{
		WindowGuard guard(surface);
		EXPECT_EQ(busy->Value("Label"), "new");
	}
	EXPECT_EQ(ShownValue("Name"), "Control1");
	EXPECT_EQ(robot.Text("efStringEdit"), "Control1");
	EXPECT_EQ(Value("Label"), "");
	Forget(&busy);
}


TEST_F(PropertyWinLifeTest, AComponentMayCloseItsFormsInspectorWhileItIsSet)
{
	auto busy = NewBusyControl();
	busy->onSet = [&](const char*) {
		WindowGuard guard(window);
		window->SetComponent(nullptr);
		window->SetDesignView(nullptr);
	};
	Show(busy.get(), surface->surface);
	Select("Label");
	Enter("new");
	EXPECT_EQ(window->Component(), nullptr);
	WindowGuard guard(surface);
	EXPECT_EQ(busy->Value("Label"), "new");
}


TEST_F(PropertyWinLifeTest, AnEditGoesToThePropertyThatIsShownThoughItsComponentIsNot)
{
	ShowControl();
	Select("Label");
	SurfaceWindow* other = NewForm();
	TComponent bare(nullptr, nullptr, CT_VISUAL);
	bare.ClearProperties(true);
	Show(&bare, other->surface);
	Enter("still mine");
	EXPECT_EQ(Value("Label"), "still mine");

	// And to none when that is gone.
	{
		WindowGuard guard(surface);
		control.reset();
	}
	Enter("nobody's");
	EXPECT_TRUE(IsShown("efStringEdit"));
	Show(nullptr, nullptr);
	QuitWindow(other);
}


TEST_F(PropertyWinLifeTest, TheButtonOfAPropertyThatIsGoneDoesNothing)
{
	ShowControl();
	Select("Flags");
	TComponent bare(nullptr, nullptr, CT_VISUAL);
	bare.ClearProperties(true);
	Show(&bare, nullptr);
	{
		WindowGuard guard(surface);
		control.reset();
	}
	EXPECT_TRUE(robot.ClickView("btnModalEdit"));
	EXPECT_TRUE(robot.Settle());
	Robot looker;
	looker.SetLimit(0.1);
	EXPECT_FALSE(looker.WaitForWindow("View Flags"));
	EXPECT_EQ(robot.Text("efModalEdit"), "(Flags)");
	Show(nullptr, nullptr);
}


TEST_F(PropertyWinLifeTest, ADialogStaysWhenItsComponentGoes)
{
	for (const char* property : {"Flags", "ViewColor"}) {
		auto busy = NewBusyControl();
		Show(busy.get(), surface->surface);
		Invoke(property);
		const char* title = strcmp(property, "Flags") == 0 ? "View Flags" : "Color";
		ASSERT_TRUE(robot.WaitForWindow(title));
		Forget(&busy);
		EXPECT_TRUE(robot.ClickView("btnOK"));
		EXPECT_TRUE(robot.WaitForNoWindow(title));
		ASSERT_TRUE(robot.WaitForWindow("Properties"));
	}
}


TEST_F(PropertyWinLifeTest, ADialogStaysWhenItsFormGoes)
{
	SurfaceWindow* form = NewForm();
	std::unique_ptr<PlainControl> component;
	{
		WindowGuard guard(form);
		component = std::make_unique<PlainControl>(form->surface, "Other");
	}
	Show(component.get(), form->surface);
	Invoke("ViewColor");
	ASSERT_TRUE(robot.WaitForWindow("Color"));
	Show(nullptr, nullptr);
	QuitWindow(form);
	component.reset();
	EXPECT_TRUE(robot.ClickView("btnOK"));
	EXPECT_TRUE(robot.WaitForNoWindow("Color"));
}


TEST_F(PropertyWinLifeTest, TheLastOfManyRefreshesIsShown)
{
	ShowControl();
	Select("Top");
	for (int32 i = 1; i <= 1000; i++) {
		{
			WindowGuard guard(surface);
			control->FindProperty("Top")->Editor()->SetValue(std::to_string(i).c_str(), false);
		}
		window->UpdateDisplayValues();
	}
	EXPECT_TRUE(robot.WaitForText("efStringEdit", "1000"));
	EXPECT_EQ(ShownValue("Top"), "1000");
}


TEST_F(PropertyWinLifeTest, FormsMayReachForTheWindowWhileItEdits)
{
	constexpr int32 kRounds = 150;
	SurfaceWindow* otherForm = NewForm();
	ShowControl();
	std::atomic<bool> done = false;

	// As the design form does while a component is dragged and clicked.
	std::thread dragger([&] {
		for (int32 i = 0; !done; i++) {
			WindowGuard guard(surface);
			control->FindProperty("Top")->Editor()->SetValue(
				std::to_string(i % 100).c_str(), i % 2 == 0);
			control->EventAt(i % 5)->selected = i % 3 == 0;
			window->UpdateDisplayValues();
			if (i % 4 == 0) {
				WindowGuard inner(window);
				window->SetDesignView(surface->surface);
				window->SetComponent(i % 16 == 0 ? nullptr : control.get());
			}
		}
	});

	// A form whose components come and go, each after the window has forgotten it.
	std::thread maker([&] {
		while (!done) {
			std::unique_ptr<PlainControl> component;
			{
				WindowGuard guard(otherForm);
				component = std::make_unique<PlainControl>(otherForm->surface, "Short");
			}
			{
				WindowGuard guard(window);
				window->SetDesignView(otherForm->surface);
				window->SetComponent(component.get());
			}
			window->UpdateDisplayValues();
			{
				WindowGuard guard(window);
				if (window->Component() == component.get())
					window->SetComponent(nullptr);
			}
			WindowGuard guard(otherForm);
			BView* view = component->DTView();
			component.reset();
			view->RemoveSelf();
			delete view;
		}
	});

	// The user.
	for (int32 i = 0; i < kRounds && !HasFatalFailure(); i++) {
		{
			WindowGuard guard(window);
			BListView* list = List("lvProperties");
			list->Select(i % 14);
			List("lvEvents")->Select(i % 10);
		}
		Tell(i % 2 == 0 ? PWM_PROPERTY_SELECTED : PWM_EVENT_INVOKED);
		Tell(i % 2 == 0 ? PWM_STRING_EDIT : PWM_PICK, "true");
		if (i % 10 == 0) {
			Tell(PWM_MODAL_EDIT_BUTTON);
			for (const char* title : {"View Flags", "Color"}) {
				robot.SetLimit(0.01);
				if (robot.WaitForWindow(title)) {
					robot.Window().SendMessage(1);
					robot.SetLimit(10);
					EXPECT_TRUE(robot.WaitForNoWindow(title));
				}
			}
			robot.SetLimit(10);
		}
		Tell(PWM_PROPERTY_INVOKED);
	}
	done = true;
	dragger.join();
	maker.join();

	// What a double click opened.
	for (const char* title : {"View Flags", "Color"}) {
		robot.SetLimit(0.2);
		while (robot.WaitForWindow(title)) {
			const BMessenger dialog = robot.Window();
			dialog.SendMessage(2);
			for (int32 i = 0; dialog.IsValid() && i < 10000; i++)
				snooze(1000);
			ASSERT_FALSE(dialog.IsValid());
		}
	}
	robot.SetLimit(10);
	ASSERT_TRUE(robot.WaitForWindow("Properties"));
	Show(nullptr, nullptr);
	ShowControl();
	EXPECT_EQ(ShownValue("Top"), Value("Top"));
	EXPECT_EQ(ShownValue("Label"), Value("Label"));
	QuitWindow(otherForm);
}
