// SPDX-License-Identifier: MIT
// Goes through all properties of a component in the property window, and edits each as a user does.

#include "PropertyWalk.h"

#include <algorithm>

#include <Control.h>
#include <Font.h>

#include "designer/DesignForm.h"
#include "designer/DesignFormView.h"
#include "model/ColorText.h"
#include "model/PropertyStore.h"
#include "palette/PaletteCatalog.h"
#include "props/StringList.h"
#include "props/StringProperty.h"
#include "support/ComponentLibraries.h"

namespace {

const BPoint kPlace(400, 60);

bool
IsColor(const std::string& name)
{
	return name.find("Color") != std::string::npos;
}


std::string
DialogFor(const std::string& name)
{
	if (name == "WindowFlags")
		return "Window Flags";
	if (name == "Zones")
		return name;
	return IsColor(name) ? "Color" : "View Flags";
}


const BFont*
SystemFont(const std::string& name)
{
	if (name == "be_bold_font")
		return be_bold_font;
	return name == "be_fixed_font" ? be_fixed_font : be_plain_font;
}


BFont
FontOf(BView* view)
{
	BFont font;
	view->GetFont(&font);
	return font;
}

} // namespace

void
PropertyWalk::SetUp()
{
	PropertyWinTest::SetUp();
	if (PaletteCatalog().CountPalEntries() == 0)
		LoadComponentLibraries();
	RenewForm();
}


void
PropertyWalk::TearDown()
{
	Show(nullptr, nullptr);
	Close(form);
	PropertyWinTest::TearDown();
}


void
PropertyWalk::RenewForm()
{
	Show(nullptr, nullptr);
	if (form != nullptr)
		Close(form);
	seen.clear();
	form = new TDesignForm("Form1");
	{
		WindowGuard guard(form);
		form->MoveTo(kPlace);
		form->ResizeTo(300, 200);
		form->Show();
	}
	robot.Settle();
}


TDesignForm*
PropertyWalk::Load(const char* path)
{
	TDesignForm* loaded = new TDesignForm("Form1");
	{
		WindowGuard guard(loaded);
		EXPECT_TRUE(loaded->LoadFromFile(path));
		loaded->Show();
	}
	robot.Settle();
	return loaded;
}


void
PropertyWalk::Close(TDesignForm* closed)
{
	if (closed->Lock())
		closed->Quit();
}


TComponent*
PropertyWalk::Place(const char* className, BRect frame)
{
	WindowGuard guard(form);
	PaletteCatalog().SetDropEntry(PaletteCatalog().FindPalEntry(className));
	TComponent* component = form->CreateComponent(form->View(), frame);
	form->DoneDroppingComponent();
	return component;
}


void
PropertyWalk::ShowOnForm(TComponent* component)
{
	Show(nullptr, nullptr);
	Show(component, form->View());
	{
		WindowGuard guard(window);
		window->Activate();
	}
	ASSERT_TRUE(robot.WaitForWindow("Properties"));
	robot.Settle();
}


std::string
PropertyWalk::ValueOf(TComponent* component, const std::string& name)
{
	robot.Settle();
	WindowGuard guard(form);
	return component->FindProperty(name.c_str())->Value();
}


std::string
PropertyWalk::StoredValueOf(TComponent* component, const std::string& name)
{
	WindowGuard guard(form);
	const char* value;
	return component->PropertyStore()->FindString(name.c_str(), &value) == B_OK ? value : "none";
}


PropertyWalk::Values
PropertyWalk::ValuesOf(TComponent* component)
{
	Values values;
	for (int32 i = 0; i < component->CountProperties(); i++)
		values[component->PropertyAt(i)->Name()] = component->PropertyAt(i)->Value();
	return values;
}


bool
PropertyWalk::LooksLike(const WindowPicture& one, const WindowPicture& other)
{
	// An active form has a border.
	return one.SameIn(other, BRect(2, 2, one.width - 3, one.height - 3));
}


WindowPicture
PropertyWalk::PictureOf(TDesignForm* shown)
{
	const BMessenger before = robot.Window();
	robot.SetWindow(BMessenger(shown));
	WindowPicture picture = robot.Picture();
	robot.SetWindow(before);
	return picture;
}


std::vector<std::string>
PropertyWalk::ChoicesOf(TComponent* component, const std::string& name)
{
	WindowGuard guard(form);
	TStringList list(20);
	component->FindProperty(name.c_str())->Editor()->GetValuePickList(&list);
	std::vector<std::string> choices;
	for (int32 i = 0; i < list.CountItems(); i++)
		choices.push_back(list.StringAt(i));
	return choices;
}


/// What the platform's views have themselves, the design-time view must have as it is now. Whether \a name is such a
/// property.
bool
PropertyWalk::ExpectInView(TComponent* component, const std::string& name, const std::string& value)
{
	WindowGuard guard(form);
	BView* view = component->DTView();
	if (view == nullptr)
		return false; // the application
	const BRect frame = component == form ? form->Frame() : view->Frame();
	const std::map<std::string, float> edges = {
		{"Left", frame.left}, {"Top", frame.top}, {"Right", frame.right}, {"Bottom", frame.bottom}};
	const auto edge = edges.find(name);
	if (edge != edges.end()) {
		EXPECT_EQ(edge->second, std::stoi(value));
		return true;
	}
	const std::map<std::string, rgb_color> colors = {{"ViewColor", view->ViewColor()},
		{"HighColor", view->HighColor()}, {"LowColor", view->LowColor()}};
	const auto color = colors.find(name);
	if (color != colors.end()) {
		char text[kColorTextSize];
		EXPECT_EQ(RGBColorToStr(color->second, text), value);
		return true;
	}

	const BControl* control = dynamic_cast<BControl*>(view);
	if (name == "Font") {
		EXPECT_EQ(FontOf(view).FamilyAndStyle(), SystemFont(value)->FamilyAndStyle());
	} else if (name == "FontSize") {
		EXPECT_EQ(FontOf(view).Size(), std::stoi(value));
	} else if (name == "Title") {
		EXPECT_STREQ(form->Title(), value.c_str());
	} else if (name == "Label" && control != nullptr) {
		EXPECT_STREQ(control->Label(), value.c_str());
	} else if (name == "Enabled" && control != nullptr) {
		EXPECT_EQ(control->IsEnabled(), value == "true");
	} else {
		return false;
	}
	return true;
}


void
PropertyWalk::WaitForEndOf(const std::string& dialog)
{
	ASSERT_TRUE(robot.WaitForNoWindow(dialog.c_str()));
	// As the dialog does it where there is a main window.
	window->UpdateDisplayValues();
	ASSERT_TRUE(robot.WaitForWindow("Properties"));
	robot.Settle();
}


/// What is typed for a text property.
std::string
PropertyWalk::NewText(TComponent* component, const std::string& name, int round)
{
	const std::string before = ValueOf(component, name);
	// Right and bottom edges move with the others.
	if (name == "Left" || name == "Top")
		return std::to_string(std::stoi(before) + 1 + round);
	if (name == "Right" || name == "Bottom")
		return std::to_string(std::stoi(before) + 3 + round);
	if (name == "Items" || name == "Tabs")
		return round == 1 ? "One|Two" : "Red|Green|Blue";
	if (name.find("File") != std::string::npos)
		return std::string(PLIM_SOURCE_DIR "/docs/images/") + (round == 1 ? "hello" : "designer")
			+ ".png";
	if (name == "Selected" || name == "Selection")
		return std::to_string(round % 2);
	// A range with a value in it, and room for a label.
	if (name.find("Max") == 0)
		return std::to_string(60 * round);
	if (name == "Value")
		return std::to_string(40 + round);
	if (name == "Time")
		return "04:3" + std::to_string(round) + ":10";
	if (name == "Minimum" || name == "Divider")
		return std::to_string((name == "Divider" ? 50 : 0) + 10 * round);
	WindowGuard guard(form);
	const TPropertyEditor* editor = component->FindProperty(name.c_str())->Editor();
	if (dynamic_cast<const TIntProperty*>(editor) != nullptr)
		return "1" + std::to_string(round);
	return (name == "Text" ? "A text in several words, longer than a line of it " : "Text")
		+ std::to_string(round);
}


/// The choice after the present one, and where it is in the list.
std::string
PropertyWalk::NextChoice(TComponent* component, const std::string& name, size_t* index)
{
	const std::vector<std::string> choices = ChoicesOf(component, name);
	const auto current = std::find(choices.begin(), choices.end(), ValueOf(component, name));
	*index = current == choices.end() || current + 1 == choices.end()
		? 0
		: current + 1 - choices.begin();
	return choices[*index];
}


/// Edits a property with the pointer, typing only what must be typed. Returns the value that must come out; none
/// when any other than before will do.
std::string
PropertyWalk::EditByMouse(TComponent* component, const std::string& name, int round)
{
	Select(name.c_str());
	switch (component->FindProperty(name.c_str())->Editor()->Type()) {
		case PET_STRING:
		{
			const std::string text = NewText(component, name, round);
			Enter(text.c_str());
			return text;
		}

		case PET_PICKLIST:
		{
			size_t index;
			const std::string choice = NextChoice(component, name, &index);
			EXPECT_TRUE(robot.ClickView("mfPickEdit"));
			EXPECT_TRUE(robot.ClickItem(choice.c_str()));
			return choice;
		}

		default:
			break;
	}

	EXPECT_TRUE(robot.ClickView("btnModalEdit"));
	const std::string dialog = DialogFor(name);
	EXPECT_TRUE(robot.WaitForWindow(dialog.c_str()));
	if (dialog == "Color") {
		BPoint middle;
		EXPECT_TRUE(robot.FindView("ccColors", &middle));
		robot.Click(BPoint(middle.x - 70, middle.y));
	} else
		EXPECT_TRUE(
			robot.ClickView(dialog == "View Flags" ? "Pulse Needed" : "No workspace activation"));
	EXPECT_TRUE(robot.ClickView("btnOK"));
	WaitForEndOf(dialog);
	return "";
}


/// The same with keys alone. The list has the keyboard focus before and after, and the row before is selected.
std::string
PropertyWalk::EditByKeys(TComponent* component, const std::string& name, int round)
{
	robot.Key(RowOf(name.c_str()) == 0 ? "home" : "down");
	robot.Key("tab");
	std::string expected;
	switch (component->FindProperty(name.c_str())->Editor()->Type()) {
		case PET_STRING:
			expected = NewText(component, name, round);
			// Second thoughts first.
			robot.Type("9");
			robot.Key("escape");
			robot.Type(expected.c_str());
			robot.Key("enter");
			break;

		case PET_PICKLIST:
		{
			size_t index;
			expected = NextChoice(component, name, &index);
			// The menu begins at the present choice.
			robot.Key("space");
			robot.Key("home");
			for (size_t i = 0; i < index; i++)
				robot.Key("down");
			robot.Key("enter");
			break;
		}

		default:
		{
			const std::string dialog = DialogFor(name);
			rgb_color color = {};
			StrToRGBColor(ValueOf(component, name).c_str(), &color);
			robot.Key("space");
			EXPECT_TRUE(robot.WaitForWindow(dialog.c_str()));
			if (dialog == "Zones") {
				// It begins in its text.
				robot.Key("command+a");
				robot.Type(("0..5" + std::to_string(round) + " {0,0,200,255}").c_str());
				robot.Key("tab");
				robot.Key("tab");
			} else
				robot.Key("tab");
			if (dialog == "Zones") {
				// The button OK.
			} else if (dialog == "Color") {
				for (int i = 0; i < 3; i++)
					robot.Key(color.red < 128 ? "right" : "left");
			} else
				robot.Key("space");
			robot.Key("enter");
			WaitForEndOf(dialog);
			break;
		}
	}
	robot.Settle();
	robot.Key("shift+tab");
	return expected;
}


void
PropertyWalk::EditAll(TComponent* component, Hand hand, int round)
{
	ShowOnForm(component);
	{
		WindowGuard guard(window);
		List("lvProperties")->MakeFocus(true);
	}
	for (int32 i = 0; i < component->CountProperties() && !HasFatalFailure(); i++)
		Edit(component, component->PropertyAt(i)->Name(), hand, round);
}


void
PropertyWalk::Edit(TComponent* component, const std::string& name, Hand hand, int round)
{
	SCOPED_TRACE(std::string(component->ClassName()) + " " + name
		+ (hand == Hand::kMouse ? " by mouse" : " by keys"));
	const WindowPicture picture = PictureOf(form);
	const std::string before = ValueOf(component, name);
	const std::string expected = hand == Hand::kMouse ? EditByMouse(component, name, round)
													  : EditByKeys(component, name, round);
	const std::string after = ValueOf(component, name);
	EXPECT_NE(after, before);
	EXPECT_TRUE(expected.empty() || after == expected) << after << " in place of " << expected;
	EXPECT_EQ(StoredValueOf(component, name), after);
	std::string displayed;
	{
		WindowGuard guard(form);
		displayed = component->FindProperty(name.c_str())->Editor()->GetDisplayValue();
	}
	EXPECT_EQ(ShownValue(name.c_str()), displayed);
	if (ExpectInView(component, name, after) || !LooksLike(picture, PictureOf(form)))
		seen.insert(name);
}
