// SPDX-License-Identifier: MIT
// Tests of component owners.

#include "model/ComponentOwner.h"

#include <vector>

#include <gtest/gtest.h>

#include "model/Component.h"
#include "model/FormDesigner.h"

namespace {

/// Writes its number down when it is destroyed.
class TWitness : public TComponent {
public:
	TWitness(int number, std::vector<int>* destroyed)
		: TComponent(nullptr, nullptr, CT_VISUAL),
		  fNumber(number),
		  fDestroyed(destroyed)
	{
	}

	~TWitness() override { fDestroyed->push_back(fNumber); }

private:
	int fNumber;
	std::vector<int>* fDestroyed;
};


TComponent*
SomeComponent()
{
	static TComponent sComponent(nullptr, nullptr, CT_VISUAL);
	return &sComponent;
}

} // namespace

TEST(ComponentOwnerTest, AddingMakesTheOwner)
{
	TComponentOwner owner;
	TComponent first(nullptr, nullptr, CT_VISUAL);
	TComponent second(nullptr, nullptr, CT_VISUAL);
	owner.AddComponent(&first);
	owner.AddComponent(&second);

	EXPECT_EQ(owner.CountComponents(), 2);
	EXPECT_EQ(owner.ComponentAt(0), &first);
	EXPECT_EQ(owner.ComponentAt(1), &second);
	EXPECT_EQ(first.Owner(), &owner);
	EXPECT_EQ(second.Owner(), &owner);
}


TEST(ComponentOwnerTest, AllButTheKeptOneAreDeselected)
{
	TComponentOwner owner;
	TComponent components[] = {{nullptr, nullptr, CT_VISUAL}, {nullptr, nullptr, CT_VISUAL},
		{nullptr, nullptr, CT_VISUAL}};
	for (TComponent& component : components) {
		owner.AddComponent(&component);
		component.DesignerSelect(true);
	}

	owner.DeselectComponents(&components[1]);
	EXPECT_FALSE(components[0].IsDesignerSelected());
	EXPECT_TRUE(components[1].IsDesignerSelected());
	EXPECT_FALSE(components[2].IsDesignerSelected());
	owner.DeselectComponents(nullptr);
	EXPECT_FALSE(components[1].IsDesignerSelected());
}


TEST(ComponentOwnerTest, RemovingLeavesTheComponentWithoutOwner)
{
	TComponentOwner owner;
	TComponent first(nullptr, nullptr, CT_VISUAL);
	TComponent second(nullptr, nullptr, CT_VISUAL);
	owner.AddComponent(&first);
	owner.AddComponent(&second);

	EXPECT_TRUE(owner.RemoveComponent(&first));
	EXPECT_EQ(first.Owner(), nullptr);
	EXPECT_EQ(owner.CountComponents(), 1);
	EXPECT_EQ(owner.RemoveComponent(int32(0)), &second);
	EXPECT_EQ(second.Owner(), nullptr);
	EXPECT_EQ(owner.CountComponents(), 0);
}


TEST(ComponentOwnerTest, RemovingWhatIsNotThereIsHarmless)
{
	TComponentOwner owner;
	TComponentOwner other;
	TComponent component(nullptr, nullptr, CT_VISUAL);
	other.AddComponent(&component);

	EXPECT_FALSE(owner.RemoveComponent(&component));
	EXPECT_EQ(component.Owner(), &other);
	EXPECT_FALSE(owner.RemoveComponent(static_cast<TComponent*>(nullptr)));
	EXPECT_EQ(owner.RemoveComponent(int32(0)), nullptr);
	EXPECT_EQ(owner.RemoveComponent(int32(-1)), nullptr);
	EXPECT_EQ(owner.ComponentAt(0), nullptr);
	EXPECT_EQ(owner.ComponentAt(-1), nullptr);
}


TEST(ComponentOwnerTest, AddingNothingIsHarmless)
{
	TComponentOwner owner;
	owner.AddComponent(nullptr);
	EXPECT_EQ(owner.CountComponents(), 0);
}


TEST(ComponentOwnerTest, ClearingDestroysInListOrderWhenAsked)
{
	std::vector<int> destroyed;
	TComponentOwner owner;
	for (int i = 0; i < 50; i++)
		owner.AddComponent(new TWitness(i, &destroyed));
	owner.ClearComponents(true);

	EXPECT_EQ(owner.CountComponents(), 0);
	ASSERT_EQ(destroyed.size(), 50u);
	for (int i = 0; i < 50; i++)
		EXPECT_EQ(destroyed[i], i);
}


TEST(ComponentOwnerTest, ClearingWithoutDeletingKeepsTheComponents)
{
	TComponentOwner owner;
	TComponent component(nullptr, nullptr, CT_VISUAL);
	owner.AddComponent(&component);
	owner.ClearComponents(false);
	EXPECT_EQ(owner.CountComponents(), 0);
	EXPECT_STREQ(component.ComponentName(), "");
}


TEST(ComponentOwnerTest, TheEndOfAnOwnerKeepsTheComponents)
{
	std::vector<int> destroyed;
	TWitness component(1, &destroyed);
	{
		TComponentOwner owner;
		owner.AddComponent(&component);
	}
	EXPECT_TRUE(destroyed.empty());
}


TEST(ComponentOwnerTest, ChangesAreAccepted)
{
	TComponentOwner owner;
	EXPECT_TRUE(owner.ComponentPropertyModified(SomeComponent(), "Name", "a", "b"));
}


TEST(FormDesignerTest, TheBaseNeitherCreatesNorWaits)
{
	TFormDesigner designer;
	EXPECT_FALSE(designer.IsDropWaiting());
	EXPECT_EQ(designer.DTFormView(), nullptr);
	EXPECT_EQ(designer.CountComponents(), 0);
}


TEST(FormDesignerTest, WindowAndSurfaceStandForTheSameForm)
{
	// The pointer is only compared.
	int place = 0;
	BView* view = reinterpret_cast<BView*>(&place);
	TFormDesigner window;
	TFormDesigner surface;
	TFormDesigner other;
	TComponentOwner container;
	window.SetDTFormView(view);
	surface.SetDTFormView(view);

	EXPECT_TRUE(window.IsForm(&window));
	EXPECT_TRUE(window.IsForm(&surface));
	EXPECT_TRUE(surface.IsForm(&window));
	EXPECT_FALSE(window.IsForm(&other));
	EXPECT_FALSE(other.IsForm(&window));
	EXPECT_FALSE(window.IsForm(&container));
	EXPECT_FALSE(window.IsForm(nullptr));
	EXPECT_TRUE(other.IsForm(&other));
}
