// SPDX-License-Identifier: MIT
// The order of the virtual operations, which component libraries are compiled against.

#include <cstring>
#include <vector>

#include <Point.h>
#include <Rect.h>
#include <String.h>
#include <gtest/gtest.h>

#include "model/Component.h"
#include "model/ComponentOwner.h"
#include "model/FormDesigner.h"
#include "model/Property.h"
#include "props/PropertyEditor.h"

namespace {

/// The slots of a class's virtual operations, in the order in which they are added.
class SlotList {
public:
	/// \a member: a pointer to a virtual operation. Its first word is the offset in the table of
	/// virtual operations, plus one.
	template <class Member>
	SlotList& Add(Member member)
	{
		static_assert(sizeof(member) == 2 * sizeof(ptrdiff_t));
		ptrdiff_t words[2];
		memcpy(words, &member, sizeof(words));
		EXPECT_EQ(words[0] & 1, 1) << "entry " << fSlots.size() << " is not virtual";
		fSlots.push_back((words[0] - 1) / ptrdiff_t(sizeof(void*)));
		return *this;
	}

	/// Whether the slots follow each other from \a first on.
	void ExpectFrom(ptrdiff_t first) const
	{
		for (size_t i = 0; i < fSlots.size(); i++)
			EXPECT_EQ(fSlots[i], first + ptrdiff_t(i)) << "entry " << i;
	}

private:
	std::vector<ptrdiff_t> fSlots;
};


/// A virtual destructor takes two slots.
const ptrdiff_t kAfterDestructor = 2;

} // namespace

TEST(SlotOrderTest, OfAComponent)
{
	using C = TComponent;
	SlotList()
		.Add(&C::SetComponentName)
		.Add(&C::ComponentName)
		.Add(&C::SetComponentType)
		.Add(&C::ComponentType)
		.Add(&C::SetOwner)
		.Add(&C::Owner)
		.Add(&C::SetComponentMode)
		.Add(&C::ComponentMode)
		.Add(&C::SetDesigner)
		.Add(&C::Designer)
		.Add(&C::DesignerSelect)
		.Add(&C::IsDesignerSelected)
		.Add(&C::SetModified)
		.Add(&C::Modified)
		.Add(&C::PropertyModified)
		.Add(&C::DesignerDrawSelection)
		.Add(&C::AddComponentContextMenuItems)
		.Add(&C::HandleComponentContextMessage)
		.Add(&C::DefaultEditAction)
		.Add(&C::HandleComponentDesignMessage)
		.Add(&C::CanDropOnDesignerAt)
		.Add(&C::DroppedOnFormDesigner)
		.Add(&C::SelectedInFormDesigner)
		.Add(&C::InvokedInFormDesigner)
		.Add(&C::PopupMenuInvokedInFormDesigner)
		.Add(&C::MenuItemSelectedInFormDesigner)
		.Add(&C::DeletedFromFormDesigner)
		.Add(&C::AddedToPalette)
		.Add(&C::PopupMenuInvokedInPalette)
		.Add(&C::MenuItemSelectedInPalette)
		.Add(&C::DeletedFromPalette)
		.Add(&C::DesignerMouseDown)
		.Add(static_cast<void (C::*)(BView*, BPoint)>(&C::MoveComponentTo))
		.Add(static_cast<void (C::*)(BPoint)>(&C::MoveComponentTo))
		.Add(static_cast<void (C::*)(BView*, BRect)>(&C::ResizeComponentTo))
		.Add(static_cast<void (C::*)(BRect)>(&C::ResizeComponentTo))
		.Add(&C::GetPropertyValue)
		.Add(&C::SetPropertyValue)
		.Add(&C::EventSelection)
		.Add(&C::SetEventSelection)
		.Add(&C::InitPropertyList)
		.Add(&C::InitEventList)
		.Add(&C::InitPropertyValues)
		.Add(&C::InitEventValues)
		.Add(&C::WriteExtendedComponentDataTo)
		.Add(&C::ReadExtendedComponentDataFrom)
		.Add(&C::HeaderFile)
		.Add(&C::OnGenConstructorCall)
		.Add(&C::OnSetConstructorParams)
		.Add(&C::OnGenHeaderFileTop)
		.Add(&C::OnGenInitForm)
		.Add(&C::OnGenDestroyForm)
		.Add(&C::AddProperty)
		.Add(&C::AddPropAndEditor)
		.Add(static_cast<bool (C::*)(TProperty*)>(&C::RemoveProperty))
		.Add(static_cast<TProperty* (C::*)(int32)>(&C::RemoveProperty))
		.Add(&C::ClearProperties)
		.Add(&C::AddEvent)
		.Add(static_cast<bool (C::*)(TEvent*)>(&C::RemoveEvent))
		.Add(static_cast<TEvent* (C::*)(int32)>(&C::RemoveEvent))
		.Add(&C::ClearEvents)
		.ExpectFrom(kAfterDestructor);
}


TEST(SlotOrderTest, OfAComponentOwnerAndAFormDesigner)
{
	using O = TComponentOwner;
	using D = TFormDesigner;
	SlotList()
		.Add(&O::ComponentPropertyModified)
		.Add(&O::CountComponents)
		.Add(&O::ComponentAt)
		.Add(&O::AddComponent)
		.Add(static_cast<bool (O::*)(TComponent*)>(&O::RemoveComponent))
		.Add(static_cast<TComponent* (O::*)(int32)>(&O::RemoveComponent))
		.Add(&O::ClearComponents)
		.Add(&D::DesignFormShown)
		.Add(&D::DesignFormActivated)
		.Add(&D::ComponentSelected)
		.Add(&D::ComponentMoved)
		.Add(&D::ComponentResized)
		.Add(&D::IsDropWaiting)
		.Add(&D::CreateComponent)
		.Add(&D::DoneDroppingComponent)
		.Add(&D::SetDTFormView)
		.ExpectFrom(kAfterDestructor);
}


TEST(SlotOrderTest, OfAProperty)
{
	using P = TProperty;
	SlotList()
		.Add(&P::Owner)
		.Add(&P::Name)
		.Add(&P::Editor)
		.Add(&P::SetEditor)
		.Add(&P::SetSetStatement)
		.Add(&P::SetStatement)
		.Add(&P::SetGetStatement)
		.Add(&P::GetStatement)
		.Add(&P::WriteExtendedData)
		.Add(&P::ReadExtendedData)
		.ExpectFrom(0);
}


TEST(SlotOrderTest, OfAPropertyEditor)
{
	using E = TPropertyEditor;
	SlotList()
		.Add(&E::Activate)
		.Add(&E::ModalEdit)
		.Add(&E::Modified)
		.Add(&E::Initialize)
		.Add(&E::EditLimit)
		.Add(&E::SetValue)
		.Add(&E::GetValue)
		.Add(&E::GetDisplayValue)
		.Add(&E::GetValuePickList)
		.Add(&E::GetValueList)
		.ExpectFrom(kAfterDestructor);
}
