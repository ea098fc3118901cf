// SPDX-License-Identifier: MIT

#include "ZonesEditor.h"

#include <ScrollView.h>
#include <StringView.h>
#include <TextView.h>

#include "ZonesText.h"

namespace {

constexpr float kWidth = 350;
constexpr float kTextHeight = 110;
constexpr float kLineHeight = 16;

/// The lines. A tab goes on to the buttons.
class LinesView : public BTextView {
public:
	using BTextView::BTextView;

	void KeyDown(const char* bytes, int32 numBytes) override
	{
		if (numBytes == 1 && *bytes == B_TAB)
			// NOLINTNEXTLINE(bugprone-parent-virtual-call): the text view would insert it
			BView::KeyDown(bytes, numBytes);
		else
			BTextView::KeyDown(bytes, numBytes);
	}
};


/// The dialog: zones are lines of a text. It stays open while one of them cannot be read.
class ZonesWin : public TPropertyModalEdit {
public:
	ZonesWin(const char* value, const TPendingEdit& edit)
		: TPropertyModalEdit(BRect(0, 0, kWidth, 100), "Zones", value, edit),
		  fLines(nullptr),
		  fHint(nullptr)
	{
	}

	void InitWindow() override
	{
		BView* ground = AddDialogGround(this);
		BRect frame(kDialogSpace, kDialogSpace, kWidth - kDialogSpace, kDialogSpace + kLineHeight);
		fHint = new BStringView(frame, "lblHint", "A line for each: 0..60 {60,160,60,255}");
		ground->AddChild(fHint);

		frame.top = frame.bottom + kDialogSpace;
		frame.bottom = frame.top + kTextHeight;
		frame.right -= B_V_SCROLL_BAR_WIDTH;
		fLines = new LinesView(frame, "tvZones", frame.OffsetToCopy(0, 0).InsetByCopy(4, 4),
			B_FOLLOW_NONE, B_WILL_DRAW | B_NAVIGABLE);
		ground->AddChild(new BScrollView("svZones", fLines, B_FOLLOW_NONE, 0, false, true));
		AddDialogButtons(this, ground, BPoint(kWidth, frame.bottom), PME_OK, PME_CANCEL);
		// Enter begins the next line.
		SetDefaultButton(nullptr);
	}

	void InitControls() override
	{
		BString lines(Text());
		lines.ReplaceAll("|", "\n");
		fLines->SetText(lines.String());
		fLines->MakeFocus();
	}

	void MessageReceived(BMessage* message) override
	{
		std::vector<Gauges::zone> zones;
		if (message->what == PME_OK && !ReadZones(fLines->Text(), '\n', &zones))
			fHint->SetText("A line cannot be read. Write: 0..60 {60,160,60,255}");
		else
			TPropertyModalEdit::MessageReceived(message);
	}

	void OnApply() override
	{
		std::vector<Gauges::zone> zones;
		ReadZones(fLines->Text(), '\n', &zones);
		SetText(ZonesText(zones, '|').String());
	}

private:
	BTextView* fLines;
	BStringView* fHint;
};

} // namespace

TZonesEditor::TZonesEditor(TComponent* component, TProperty* property)
	: TPropertyEditor(component, property, PET_MODAL)
{
}


bool
TZonesEditor::ModalEdit()
{
	const TPendingEdit edit(this);
	BString value;
	if (!edit.Read(&value))
		return false;
	ZonesWin* dialog = new ZonesWin(value.String(), edit);
	dialog->InitWindow();
	dialog->InitControls();
	dialog->Show();
	return true;
}


const char*
TZonesEditor::GetDisplayValue() const
{
	std::vector<Gauges::zone> zones;
	ReadZones(GetValue(), '|', &zones);
	fShown = "";
	fShown << static_cast<int32>(zones.size()) << (zones.size() == 1 ? " zone" : " zones");
	return fShown.String();
}
