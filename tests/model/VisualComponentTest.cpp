// SPDX-License-Identifier: MIT
// Tests of the tables and stored values of visual components. Those that need a window are in
// DesignViewTest.cpp.

#include "model/VisualComponent.h"

#include <string>

#include <Rect.h>
#include <String.h>
#include <gtest/gtest.h>

#include "model/Event.h"
#include "model/Property.h"
#include "model/PropertyStore.h"
#include "model/ViewComponent.h"
#include "props/FlagsProperty.h"
#include "props/PickListProperty.h"
#include "props/RGBColorProperty.h"
#include "props/StringProperty.h"
#include "support/CapturedOutput.h"
#include "support/TidyComponent.h"

namespace {

class VisualComponentTest : public testing::Test {
protected:
	VisualComponentTest()
		: fComponent(nullptr, nullptr)
	{
		fComponent.SetComponentName("View1");
		fComponent.InitPropertyList();
		fComponent.InitEventList();
	}

	template <class Editor>
	bool HasEditor(const char* name) const
	{
		TPropertyEditor* editor = fComponent.FindProperty(name)->Editor();
		return dynamic_cast<Editor*>(editor) != nullptr
			&& editor->Property() == fComponent.FindProperty(name);
	}

	CapturedOutput fOutput;
	TidyComponent<TViewComponent> fComponent;
};

} // namespace

TEST_F(VisualComponentTest, ThePropertiesStandInOrder)
{
	const struct {
		const char* name;
		const char* value;
		bool generated;
	} kRows[] = {
		{"Name", "View1", false},
		{"Visible", "true", true},
		{"Left", "0", false},
		{"Top", "0", false},
		{"Right", "0", false},
		{"Bottom", "0", false},
		{"Flags", "B_WILL_DRAW|B_NAVIGABLE", true},
		{"ViewColor", "{216,216,216,255}", true},
		{"HighColor", "{0,0,0,0}", true},
		{"LowColor", "{255,255,255,255}", true},
		{"Font", "be_plain_font", true},
		{"FontSize", "10", true},
	};
	ASSERT_EQ(fComponent.CountProperties(), 12);
	for (int32 i = 0; i < 12; i++) {
		const TProperty* property = fComponent.PropertyAt(i);
		EXPECT_STREQ(property->Name(), kRows[i].name);
		EXPECT_STREQ(property->Value(), kRows[i].value) << kRows[i].name;
		EXPECT_TRUE(property->IsDefValue()) << kRows[i].name;
		EXPECT_EQ(property->IsGenerated(), kRows[i].generated) << kRows[i].name;
		EXPECT_EQ(property->IsQuoted(), i == 0) << kRows[i].name;
		EXPECT_EQ(property->Owner(), &fComponent) << kRows[i].name;
	}
}


TEST_F(VisualComponentTest, ThePropertiesHaveTheirEditors)
{
	EXPECT_TRUE(HasEditor<TNameProperty>("Name"));
	EXPECT_TRUE(HasEditor<TBoolProperty>("Visible"));
	for (const char* edge : {"Left", "Top", "Right", "Bottom"})
		EXPECT_TRUE(HasEditor<TIntProperty>(edge)) << edge;
	EXPECT_TRUE(HasEditor<TViewFlagsProperty>("Flags"));
	for (const char* color : {"ViewColor", "HighColor", "LowColor"})
		EXPECT_TRUE(HasEditor<TViewColorProperty>(color)) << color;
	EXPECT_TRUE(HasEditor<TFontProperty>("Font"));
	EXPECT_TRUE(HasEditor<TFontSizeProperty>("FontSize"));
}


TEST_F(VisualComponentTest, ColoursHaveStatementsOfTheirOwn)
{
	for (const char* color : {"ViewColor", "HighColor", "LowColor"}) {
		EXPECT_EQ(std::string(fComponent.FindProperty(color)->SetStatement().String()),
			std::string("{rgb_color clr = $VALUE;\n$COMPONENT->Set") + color + "(clr);}");
	}
	EXPECT_STREQ(fComponent.FindProperty("Flags")->SetStatement().String(),
		"View1->SetFlags(B_WILL_DRAW|B_NAVIGABLE);");
	EXPECT_STREQ(
		fComponent.FindProperty("ViewColor")->GetStatement().String(), "View1->ViewColor()");
}


TEST_F(VisualComponentTest, TheEventsStandInOrder)
{
	const struct {
		const char* name;
		const char* parameters;
	} kRows[] = {
		{"OnAllAttached", ""},
		{"OnAttachedToWindow", ""},
		{"OnAllDetached", ""},
		{"OnDraw", "BRect updateRect"},
		{"OnFrameMoved", "BPoint parentPoint"},
		{"OnFrameResized", "float width, float height"},
		{"OnKeyDown", ""},
		{"OnKeyUp", ""},
		{"OnGotFocus", ""},
		{"OnLostFocus", ""},
		{"OnMouseUp", "BPoint point"},
		{"OnMouseDown", "BPoint point"},
		{"OnMouseMoved", "BPoint point, uint32 transit, const\u00a0BMessage\u00a0*message"},
	};
	ASSERT_EQ(fComponent.CountEvents(), 13);
	for (int32 i = 0; i < 13; i++) {
		const TEvent* event = fComponent.EventAt(i);
		EXPECT_STREQ(event->name, kRows[i].name);
		EXPECT_STREQ(event->parameters != nullptr ? event->parameters : "", kRows[i].parameters);
		EXPECT_EQ(event->returnType, nullptr) << event->name;
		EXPECT_FALSE(event->selected) << event->name;
	}
}


TEST_F(VisualComponentTest, TheMouseMovedParametersHoldNoBreakSpaces)
{
	const std::string text = fComponent.FindEvent("OnMouseMoved")->parameters;
	EXPECT_EQ(text.substr(text.find("const")),
		"const\xC2\xA0"
		"BMessage\xC2\xA0*message");
}


TEST_F(VisualComponentTest, ListsAreBuiltAnew)
{
	fComponent.SetPropertyValue("Left", "20");
	fComponent.SetEventSelection("OnDraw", true);
	for (int32 i = 0; i < fComponent.CountProperties(); i++)
		delete fComponent.PropertyAt(i)->Editor();

	fComponent.InitPropertyList();
	fComponent.InitEventList();
	EXPECT_EQ(fComponent.CountProperties(), 12);
	EXPECT_EQ(fComponent.CountEvents(), 13);
	EXPECT_STREQ(fComponent.FindProperty("Left")->Value(), "0");
	EXPECT_EQ(fComponent.GetPropertyValue("Left"), nullptr);
	EXPECT_FALSE(fComponent.EventSelection("OnDraw"));
}


TEST_F(VisualComponentTest, ColoursHaveAValueBeforeOneIsStored)
{
	EXPECT_STREQ(fComponent.GetPropertyValue("ViewColor"), "{216,216,216,255}");
	EXPECT_STREQ(fComponent.GetPropertyValue("HighColor"), "{0,0,0,0}");
	EXPECT_STREQ(fComponent.GetPropertyValue("LowColor"), "{255,255,255,255}");

	fComponent.SetPropertyValue("HighColor", "{1,2,3,4}");
	EXPECT_STREQ(fComponent.GetPropertyValue("HighColor"), "{1,2,3,4}");
}


TEST_F(VisualComponentTest, EdgesReadBackTheirStoredTexts)
{
	EXPECT_EQ(fComponent.GetPropertyValue("Left"), nullptr);
	fComponent.SetPropertyValue("Left", "020");
	EXPECT_STREQ(fComponent.GetPropertyValue("Left"), "020");
	EXPECT_STREQ(fComponent.FindProperty("Left")->Value(), "020");
	EXPECT_TRUE(fComponent.Modified());
}


TEST_F(VisualComponentTest, AStoredFrameGivesTheEdges)
{
	fComponent.SetPropertyValue("Left", "99");
	fComponent.PropertyStore()->SetRect("Frame", BRect(1.9, -2, 300, 40.4));

	// All four stay readable at once.
	const char* left = fComponent.GetPropertyValue("Left");
	const char* top = fComponent.GetPropertyValue("Top");
	const char* right = fComponent.GetPropertyValue("Right");
	const char* bottom = fComponent.GetPropertyValue("Bottom");
	EXPECT_STREQ(left, "1");
	EXPECT_STREQ(top, "-2");
	EXPECT_STREQ(right, "300");
	EXPECT_STREQ(bottom, "40");
}


TEST_F(VisualComponentTest, ATextNamedFrameIsNoFrame)
{
	fComponent.SetPropertyValue("Left", "99");
	fComponent.SetPropertyValue("Frame", "{1,2,3,4}");
	EXPECT_STREQ(fComponent.GetPropertyValue("Left"), "99");
}


TEST_F(VisualComponentTest, EveryValueIsStoredWithoutAView)
{
	for (int32 i = 0; i < fComponent.CountProperties(); i++) {
		const char* name = fComponent.PropertyAt(i)->Name();
		fComponent.SetPropertyValue(name, "7");
		EXPECT_STREQ(fComponent.PropertyAt(i)->Value(), "7") << name;
		EXPECT_STREQ(fComponent.PropertyStore()->FindString(name), "7") << name;
	}
	EXPECT_STREQ(fComponent.ComponentName(), "7");
}


TEST_F(VisualComponentTest, MissingNamesAndValuesDoNothing)
{
	fComponent.SetPropertyValue("ViewColor", nullptr);
	fComponent.SetPropertyValue(nullptr, "x");
	EXPECT_EQ(fComponent.GetPropertyValue(nullptr), nullptr);
	EXPECT_TRUE(fComponent.PropertyStore()->IsEmpty());
	EXPECT_FALSE(fComponent.Modified());
}


TEST_F(VisualComponentTest, ReadingIsPrintedByEachClass)
{
	fComponent.GetPropertyValue("Flags");
	fComponent.GetPropertyValue("ViewColor");
	fComponent.SetPropertyValue("Flags", "0");
	EXPECT_EQ(fOutput.Text(),
		"TVisualComponent::GetPropertyValue('Flags')\n"
		"TComponent::GetPropertyValue('Flags')\n"
		"TVisualComponent::GetPropertyValue('ViewColor')\n"
		"TComponent::SetPropertyValue('Flags', '0')\n");
}


TEST_F(VisualComponentTest, NoConstructorParametersAreAppended)
{
	BString text("kept");
	fComponent.OnSetConstructorParams(text);
	EXPECT_STREQ(text.String(), "kept");
	EXPECT_EQ(fComponent.ComponentType(), 0);
}
