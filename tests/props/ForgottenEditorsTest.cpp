// SPDX-License-Identifier: MIT

#include "props/ForgottenEditors.h"

#include <memory>

#include <gtest/gtest.h>

#include "model/Component.h"
#include "model/Property.h"
#include "props/StringProperty.h"

namespace {

int sDeleted = 0;


class CountedEditor : public TStringProperty {
public:
	using TStringProperty::TStringProperty;
	~CountedEditor() override { sDeleted++; }
};


/// A component whose one property has \a editor.
class ForgottenEditorsTest : public testing::Test {
protected:
	ForgottenEditorsTest() { sDeleted = 0; }

	std::unique_ptr<TComponent> MakeComponent(TPropertyEditor* editor)
	{
		std::unique_ptr<TComponent> component =
			std::make_unique<TComponent>(nullptr, nullptr, CT_VISUAL);
		component->AddPropAndEditor(new TProperty(component.get(), "Title", "", nullptr, false),
			editor, nullptr, nullptr, false);
		return component;
	}
};

} // namespace


TEST_F(ForgottenEditorsTest, AnEditorGoesAfterItsComponent)
{
	CountedEditor* editor = new CountedEditor(nullptr, nullptr);
	{
		TForgottenEditors editors;
		{
			const std::unique_ptr<TComponent> component = MakeComponent(editor);
			component->AddPropAndEditor(new TProperty(component.get(), "Same", "", nullptr, false),
				editor, nullptr, nullptr, false);
			editors.Add(component.get());
		}
		EXPECT_EQ(sDeleted, 0);
	}
	EXPECT_EQ(sDeleted, 1);
}


TEST_F(ForgottenEditorsTest, OneThatItsComponentHasDeletedIsNotDeletedAgain)
{
	CountedEditor* editor = new CountedEditor(nullptr, nullptr);
	{
		TForgottenEditors editors;
		editors.Add(MakeComponent(editor).get());
		delete editor;
	}
	EXPECT_EQ(sDeleted, 1);
}


TEST_F(ForgottenEditorsTest, OneThatIsPartOfSomethingElseOrSparedStays)
{
	CountedEditor local(nullptr, nullptr);
	CountedEditor* spared = new CountedEditor(nullptr, nullptr);
	{
		TForgottenEditors editors;
		editors.Add(MakeComponent(&local).get());
		editors.Add(MakeComponent(spared).get());
		editors.Spare();
	}
	EXPECT_EQ(sDeleted, 0);
	delete spared;
}
