// SPDX-License-Identifier: MIT

#include <Box.h>
#include <Button.h>
#include <CheckBox.h>
#include <MenuBar.h>
#include <RadioButton.h>
#include <StringView.h>
#include <TextControl.h>

#include "designer/DesignerTest.h"
#include "model/Event.h"
#include "model/Property.h"
#include "palette/PaletteCatalog.h"
#include "palette/PaletteEntry.h"
#include "props/PropertyEditor.h"
#include "props/StringList.h"
#include "support/CapturedOutput.h"
#include "support/Printers.h"

class StandardLibraryTest : public DesignerTest {
protected:
	template <class View>
	static View* ViewOf(TComponent* component)
	{
		return dynamic_cast<View*>(component->DTView());
	}

	static void Set(TComponent* component, const char* name, const char* value)
	{
		CapturedOutput output;
		component->SetPropertyValue(name, value);
	}

	static std::string Params(TComponent* component)
	{
		BString text;
		component->OnSetConstructorParams(text);
		return text.String();
	}
};


TEST_F(StandardLibraryTest, EachClassHasItsNameHeaderAndOwnPropertiesAndEvents)
{
	const struct {
		const char* className;
		const char* stem;
		const char* header;
		std::vector<const char*> properties;
		std::vector<const char*> events;
	} kCases[] = {
		{"TButton", "Button", "Button.h", {"Label", "Default"}, {"OnClick"}},
		{"TCheckBox", "CheckBox", "CheckBox.h", {"Label", "Checked"}, {"OnChange"}},
		{"TTextControl", "TextControl", "TextControl.h", {"Label", "Text", "Divider"},
			{"OnChange", "OnEnter"}},
		{"TStringView", "StringView", "StringView.h", {"Text", "Alignment", "ResizingMode"},
			{"OnClick"}},
		{"TBox", "Box", "Box.h", {"Label", "Border", "ResizingMode"}, {"OnClick"}},
		{"TRadioButton", "RadioButton", "RadioButton.h", {"Label", "Checked"}, {"OnChange"}},
		{"TTextView", "TextView", "TextView.h",
			{"Text", "Editable", "Selectable", "WordWrap", "Alignment", "Autoindent", "Undo",
				"Stylable", "HideTyping", "MaxBytes", "TabWidth", "TextColor", "ResizingMode"},
			{"OnChange"}},
		{"TView", "View", "View.h", {"ResizingMode"}, {"OnClick"}},
		{"TListView", "ListView", "ListView.h", {"Items", "ListType", "ResizingMode"},
			{"OnSelect", "OnInvoke"}},
		{"TOutlineListView", "OutlineListView", "OutlineListView.h",
			{"Items", "ListType", "ResizingMode"}, {"OnSelect", "OnInvoke", "OnExpand"}},
		{"TMenuField", "MenuField", "MenuField.h",
			{"Enabled", "Label", "Items", "Selected", "Alignment", "Divider", "ResizingMode"},
			{"OnChange"}},
		{"TMenuBar", "MenuBar", "MenuBar.h", {"Enabled", "Items", "Border", "ResizingMode"},
			{"OnInvoke"}},
		{"TSlider", "Slider", "Slider.h",
			{"Label", "Minimum", "Maximum", "Value", "Orientation", "Style", "HashMarks",
				"HashMarkCount", "KeyIncrement", "MinimumLabel", "MaximumLabel", "BarThickness",
				"BarColor", "Filled", "FillColor"},
			{"OnChange", "OnModify"}},
		{"TStatusBar", "StatusBar", "StatusBar.h",
			{"Label", "TrailingLabel", "Text", "TrailingText", "MaxValue", "Value", "BarHeight",
				"BarColor", "ResizingMode"},
			{"OnClick"}},
		{"TColorControl", "ColorControl", "ColorControl.h",
			{"Label", "Layout", "CellSize", "Color"}, {"OnChange"}},
		{"TPictureView", "PictureView", "View.h", {"File", "Stretched", "Centered", "ResizingMode"},
			{"OnClick"}},
		{"TPictureButton", "PictureButton", "PictureButton.h",
			{"Label", "OffFile", "OnFile", "Behavior"}, {"OnClick"}},
		{"TScrollView", "ScrollView", "ScrollView.h", {"Border", "ResizingMode"}, {}},
		{"TTabView", "TabView", "TabView.h",
			{"Tabs", "Selection", "TabWidth", "TabSide", "ResizingMode"}, {"OnChange"}},
	};
	// The others are the gauges, and those of tests.
	EXPECT_EQ(PaletteCatalog().CountPalEntries(), static_cast<int32>(std::size(kCases)) + 4);
	EXPECT_LE(std::size(kCases), 19u);
	TDesignForm* form = NewForm();
	for (const auto& row : kCases) {
		TPaletteEntry* entry = PaletteCatalog().FindPalEntry(row.className);
		ASSERT_NE(entry, nullptr) << row.className;
		EXPECT_STREQ(entry->ComponentName(), row.stem);
		TComponent* component = Place(form, row.className, row.className);
		ASSERT_NE(component, nullptr) << row.className;
		EXPECT_STREQ(component->ClassName(), row.className);
		EXPECT_STREQ(component->HeaderFile(), row.header);
		for (const char* name : row.properties) {
			TProperty* property = component->FindProperty(name);
			ASSERT_NE(property, nullptr) << row.className << " " << name;
			EXPECT_TRUE(property->IsGenerated()) << row.className << " " << name;
			EXPECT_NE(property->Editor(), nullptr) << row.className << " " << name;
		}
		for (const char* name : row.events)
			EXPECT_NE(component->FindEvent(name), nullptr) << row.className << " " << name;
		EXPECT_STREQ(component->EventAt(0)->name, "OnAllAttached");
		EXPECT_EQ(component->CountEvents(), 13 + static_cast<int32>(row.events.size()));
	}
}


TEST_F(StandardLibraryTest, ComponentsLieInTheirFrameOnTheirParent)
{
	TDesignForm* form = NewForm();
	for (const char* name : {"TButton", "TCheckBox", "TStringView", "TBox"}) {
		TComponent* component = Place(form, name, name, BRect(15, 25, 95, 57));
		EXPECT_EQ(component->DTView()->Frame(), BRect(15, 25, 95, 57)) << name;
		EXPECT_EQ(component->DTView()->Parent(), form->View()) << name;
	}
}


TEST_F(StandardLibraryTest, AnEntryWithoutAParentMakesNothing)
{
	EXPECT_EQ(PaletteCatalog().FindPalEntry("TButton")->CreateComponent(
				  nullptr, nullptr, BRect(0, 0, 20, 20)),
		nullptr);
}


TEST_F(StandardLibraryTest, AButtonShowsItsLabelAndState)
{
	TComponent* component = Place(NewForm(), "TButton", "Button1");
	BButton* button = ViewOf<BButton>(component);
	ASSERT_NE(button, nullptr);
	Set(component, "Label", "OK");
	EXPECT_STREQ(button->Label(), "OK");
	Set(component, "Enabled", "TRUE");
	EXPECT_FALSE(button->IsEnabled());
	Set(component, "Enabled", "true");
	EXPECT_TRUE(button->IsEnabled());
	Set(component, "Default", "true");
	EXPECT_EQ(button->Frame(), BRect(10, 10, 60, 40));
	EXPECT_EQ(Params(component), "\"OK\"");
	EXPECT_STREQ(component->FindProperty("Default")->SetStatement().String(),
		"$COMPONENT->MakeDefault($VALUE);");
}


TEST_F(StandardLibraryTest, ACheckBoxShowsItsTick)
{
	TComponent* component = Place(NewForm(), "TCheckBox", "CheckBox1");
	BCheckBox* box = ViewOf<BCheckBox>(component);
	ASSERT_NE(box, nullptr);
	Set(component, "Checked", "true");
	EXPECT_EQ(box->Value(), B_CONTROL_ON);
	Set(component, "Checked", "false");
	EXPECT_EQ(box->Value(), B_CONTROL_OFF);
}


TEST_F(StandardLibraryTest, ATextControlShowsLabelTextAndDivider)
{
	TComponent* component = Place(NewForm(), "TTextControl", "TextControl1");
	BTextControl* control = ViewOf<BTextControl>(component);
	ASSERT_NE(control, nullptr);
	Set(component, "Label", "Name:");
	Set(component, "Text", "Jo");
	Set(component, "Divider", "40");
	EXPECT_STREQ(control->Label(), "Name:");
	EXPECT_STREQ(control->Text(), "Jo");
	EXPECT_EQ(control->Divider(), 40);
	EXPECT_EQ(Params(component), "\"Name:\",\"Jo\"");
}


TEST_F(StandardLibraryTest, AStringViewShowsTextAndAlignment)
{
	TComponent* component = Place(NewForm(), "TStringView", "StringView1");
	BStringView* view = ViewOf<BStringView>(component);
	ASSERT_NE(view, nullptr);
	Set(component, "Text", "Hello");
	Set(component, "Alignment", "B_ALIGN_RIGHT");
	EXPECT_STREQ(view->Text(), "Hello");
	EXPECT_EQ(view->Alignment(), B_ALIGN_RIGHT);
	Set(component, "Alignment", "nonsense");
	EXPECT_EQ(view->Alignment(), B_ALIGN_LEFT);
	EXPECT_STREQ(component->FindProperty("Text")->SetStatement().String(),
		"StringView1->SetText(\"Hello\");");

	TStringList list(20);
	component->FindProperty("Alignment")->Editor()->GetValuePickList(&list);
	component->FindProperty("Alignment")->Editor()->GetValuePickList(&list);
	ASSERT_EQ(list.CountItems(), 3);
	EXPECT_STREQ(list.StringAt(0), "B_ALIGN_LEFT");
	EXPECT_STREQ(list.StringAt(1), "B_ALIGN_RIGHT");
	EXPECT_STREQ(list.StringAt(2), "B_ALIGN_CENTER");
}


TEST_F(StandardLibraryTest, ABoxShowsLabelAndBorderAndHoldsComponents)
{
	TDesignForm* form = NewForm();
	TComponent* component = Place(form, "TBox", "Box1", BRect(10, 10, 200, 150));
	BBox* box = ViewOf<BBox>(component);
	ASSERT_NE(box, nullptr);
	Set(component, "Label", "Group");
	Set(component, "Border", "B_PLAIN_BORDER");
	EXPECT_STREQ(box->Label(), "Group");
	EXPECT_EQ(box->Border(), B_PLAIN_BORDER);
	TComponent* button = Place(form, "TButton", "Button1", BRect(10, 30, 80, 54), component);
	EXPECT_EQ(button->DTView()->Parent(), box);
	EXPECT_NE(dynamic_cast<TComponentOwner*>(component), nullptr);
}


TEST_F(StandardLibraryTest, EachContainerHoldsComponents)
{
	TDesignForm* form = NewForm();
	for (const char* name : {"TBox", "TView", "TScrollView", "TTabView"}) {
		TComponent* container = Place(form, name, name, BRect(10, 10, 200, 150));
		ASSERT_NE(dynamic_cast<TComponentOwner*>(container), nullptr) << name;
		TComponent* button = Place(form, "TButton", "Button1", BRect(10, 30, 80, 54), container);
		EXPECT_EQ(button->DTView()->Parent(), container->DTView()) << name;
		EXPECT_EQ(button->DTView()->Frame(), BRect(10, 30, 80, 54)) << name;
	}
}


TEST_F(StandardLibraryTest, SavingAndLoadingKeepsEveryPropertyOfEachClass)
{
	TDesignForm* form = NewForm();
	TComponent* tabs = nullptr;
	for (int32 i = 0; i < PaletteCatalog().CountPalEntries(); i++) {
		const char* className = PaletteCatalog().PalEntryAt(i)->ClassName();
		TComponent* component = Place(form, className, className, BRect(15, 25, 140, 97));
		if (component == nullptr)
			continue;
		if (strcmp(className, "TTabView") == 0)
			tabs = component;
		for (int32 k = 0; k < component->CountProperties(); k++) {
			TProperty* property = component->PropertyAt(k);
			TStringList list(20);
			if (property->Editor() != nullptr)
				property->Editor()->GetValuePickList(&list);
			// The last choice, and an odd text or number elsewhere.
			const char* value = list.CountItems() > 0 ? list.StringAt(list.CountItems() - 1)
				: property->IsQuoted()                ? "A|>B|C"
													  : "";
			if (strcmp(property->Name(), "Name") != 0 && *value != '\0')
				Set(component, property->Name(), value);
		}
	}
	ASSERT_NE(tabs, nullptr);
	TComponent* onPage = Place(form, "TButton", "OnPage", BRect(10, 30, 80, 54), tabs);
	Set(onPage, "Page", "1");
	const std::string path = fFolder / "all.frm";
	Save(form, path);
	ASSERT_TRUE(fResult);

	TDesignForm* loaded = NewForm("Form2");
	Load(loaded, path);
	ASSERT_TRUE(fResult);
	ASSERT_EQ(loaded->CountComponents(), form->CountComponents());
	for (int32 i = 0; i < form->CountComponents(); i++) {
		TComponent* before = form->ComponentAt(i);
		TComponent* after = Find(loaded, before->ComponentName());
		ASSERT_NE(after, nullptr) << before->ComponentName();
		EXPECT_EQ(after->DTView()->Frame(), before->DTView()->Frame()) << before->ComponentName();
		ASSERT_EQ(after->CountProperties(), before->CountProperties()) << before->ComponentName();
		for (int32 k = 0; k < before->CountProperties(); k++) {
			const TProperty* property = before->PropertyAt(k);
			EXPECT_STREQ(after->FindProperty(property->Name())->Value(), property->Value())
				<< before->ComponentName() << " " << property->Name();
		}
	}
	EXPECT_TRUE(Find(loaded, "OnPage")->DTView()->IsHidden());
}


TEST_F(StandardLibraryTest, OfSeveralCheckedRadioButtonsTheLastOneIsShown)
{
	TDesignForm* form = NewForm();
	TComponent* box = Place(form, "TBox", "Box1", BRect(10, 10, 200, 150));
	TComponent* first = Place(form, "TRadioButton", "First");
	TComponent* second = Place(form, "TRadioButton", "Second");
	TComponent* inside = Place(form, "TRadioButton", "Inside", BRect(10, 30, 80, 54), box);
	for (TComponent* component : {first, second, inside})
		Set(component, "Checked", "true");
	EXPECT_EQ(ViewOf<BRadioButton>(first)->Value(), B_CONTROL_OFF);
	EXPECT_EQ(ViewOf<BRadioButton>(second)->Value(), B_CONTROL_ON);
	EXPECT_EQ(ViewOf<BRadioButton>(inside)->Value(), B_CONTROL_ON);
	EXPECT_STREQ(first->FindProperty("Checked")->Value(), "true");

	Set(second, "Checked", "false");
	EXPECT_EQ(ViewOf<BRadioButton>(first)->Value(), B_CONTROL_ON);
	Set(second, "Checked", "true");
	second->DTView()->RemoveSelf();
	EXPECT_EQ(ViewOf<BRadioButton>(first)->Value(), B_CONTROL_ON);
	form->View()->AddChild(second->DTView());
}


TEST_F(StandardLibraryTest, TheFirstListInAScrollViewFillsIt)
{
	TDesignForm* form = NewForm();
	TComponent* scroll = Place(form, "TScrollView", "ScrollView1", BRect(10, 10, 110, 90));
	TComponent* list = Place(form, "TListView", "ListView1", BRect(30, 30, 50, 50), scroll);
	EXPECT_EQ(list->DTView()->Frame(), BRect(2, 2, 84, 64));
	EXPECT_STREQ(list->FindProperty("Right")->Value(), "84");
	Set(scroll, "Vertical", "false");
	EXPECT_EQ(list->DTView()->Frame(), BRect(2, 2, 98, 64));
	Set(scroll, "Border", "B_NO_BORDER");
	EXPECT_EQ(list->DTView()->Frame(), BRect(0, 0, 100, 65));
	Set(scroll, "Right", "150");
	EXPECT_STREQ(list->FindProperty("Right")->Value(), "140");
	EXPECT_EQ(Params(scroll), "true,false,B_NO_BORDER");
	EXPECT_FALSE(scroll->FindProperty("Horizontal")->IsGenerated());

	TComponent* other = Place(form, "TListView", "ListView2", BRect(30, 30, 50, 50), scroll);
	EXPECT_EQ(other->DTView()->Frame(), BRect(30, 30, 50, 50));

	// Taking the first one out, as for deleting them all, leaves the other one's frame to the user.
	dynamic_cast<TComponentOwner*>(scroll)->RemoveComponent(list);
	EXPECT_EQ(list->DTView()->ScrollBar(B_HORIZONTAL), nullptr);
	EXPECT_EQ(other->DTView()->Frame(), BRect(30, 30, 50, 50));
	EXPECT_STREQ(other->FindProperty("Right")->Value(), "50");
}


TEST_F(StandardLibraryTest, ATabViewShowsTheComponentsOfItsPage)
{
	TDesignForm* form = NewForm();
	TComponent* tabs = Place(form, "TTabView", "TabView1", BRect(10, 10, 200, 150));
	TComponent* first = Place(form, "TButton", "First", BRect(10, 40, 80, 64), tabs);
	EXPECT_STREQ(first->FindProperty("Page")->Value(), "0");
	Set(tabs, "Selection", "1");
	EXPECT_TRUE(first->DTView()->IsHidden(first->DTView()));
	TComponent* second = Place(form, "TButton", "Second", BRect(10, 40, 80, 64), tabs);
	EXPECT_STREQ(second->FindProperty("Page")->Value(), "1");
	EXPECT_FALSE(second->DTView()->IsHidden(second->DTView()));

	BString text;
	EXPECT_TRUE(tabs->OnGenInitForm(text));
	EXPECT_STREQ(text.String(), "$COMPONENT->SetPage(Second,1);");
	EXPECT_FALSE(first->FindProperty("Page")->IsGenerated());

	// Through the editor, as the property window does it.
	CapturedOutput output;
	second->FindProperty("Page")->Editor()->SetValue("0", true);
	first->FindProperty("Page")->Editor()->SetValue("7", true);
	EXPECT_TRUE(second->DTView()->IsHidden(second->DTView()));
	EXPECT_FALSE(first->DTView()->IsHidden(first->DTView()));
	// Who leaves is seen again.
	dynamic_cast<TComponentOwner*>(tabs)->RemoveComponent(second);
	EXPECT_FALSE(second->DTView()->IsHidden(second->DTView()));
}


TEST_F(StandardLibraryTest, AMenuBarIsNotTheMenuBarOfTheFormsWindow)
{
	TDesignForm* form = NewForm();
	BMenuBar* windowBar = form->KeyMenuBar();
	TComponent* component = Place(form, "TMenuBar", "MenuBar1", BRect(0, 0, 300, 30));
	EXPECT_EQ(form->KeyMenuBar(), windowBar);
	EXPECT_EQ(component->DTView()->Frame(), BRect(0, 0, 300, 30));
	Set(component, "Items", "File|>Open|>-|>Quit|Edit");
	BMenuBar* bar = ViewOf<BMenuBar>(component);
	ASSERT_EQ(bar->CountItems(), 2);
	EXPECT_EQ(bar->SubmenuAt(0)->CountItems(), 3);
	Set(component, "Items", "");
	EXPECT_EQ(bar->CountItems(), 0);
}


TEST_F(StandardLibraryTest, ConstructorParametersAreEscapedLiterals)
{
	TComponent* component = Place(NewForm(), "TButton", "Button1");
	Set(component, "Label", "Say \"hi\"\\\n");
	EXPECT_EQ(Params(component), "\"Say \\\"hi\\\"\\\\\\n\"");
}


TEST_F(StandardLibraryTest, ControlsOnTheSurfaceDoNotTakeTheKeyboard)
{
	TComponent* component = Place(NewForm(), "TCheckBox", "CheckBox1");
	BCheckBox* box = ViewOf<BCheckBox>(component);
	const char space = ' ';
	box->KeyDown(&space, 1);
	EXPECT_EQ(box->Value(), B_CONTROL_OFF);
	box->MakeFocus(true);
	EXPECT_FALSE(box->IsFocus());
}
