// SPDX-License-Identifier: MIT

#include <Alert.h>

#include <algorithm>
#include <atomic>
#include <cmath>

#include <Application.h>
#include <Button.h>
#include <Invoker.h>
#include <Message.h>
#include <OS.h>
#include <Screen.h>
#include <TextView.h>

#include "ControlLook.h"
#include "app/LooperPrivate.h"
#include "interface/ArchivedEnum.h"
#include "interface/UserWait.h"

using BPrivate::EnumBetween;

namespace {

constexpr uint32 kMsgAnswer = '_ans'; // "which" (int32)

constexpr float kMargin = 12;
constexpr float kIconSize = 32;
constexpr float kStripeWidth = 30;
// The text is as wide as the first of these that keeps the alert lower than half of the screen.
constexpr float kTextWidths[] = {300, 450, 600};
constexpr float kUsualButtonWidth = 75;
constexpr float kOffsetGap = 40;

/// The background of an alert: a stripe at the left and the sign of its type.
class AlertView : public BView {
public:
	AlertView(BRect frame, const BAlert* alert)
		: BView(frame, "alert", B_FOLLOW_ALL_SIDES, B_WILL_DRAW),
		  fAlert(alert)
	{
		SetViewColor(ui_color(B_PANEL_BACKGROUND_COLOR));
		SetLowColor(ViewColor());
	}

	void Draw(BRect) override
	{
		if (fAlert->Type() == B_EMPTY_ALERT)
			return;
		SetHighColor(tint_color(ViewColor(), B_DARKEN_1_TINT));
		FillRect(BRect(0, 0, kStripeWidth, Bounds().bottom));
		DrawSign();
	}

private:
	/// A disc in the colour of the type, with a letter or mark on it.
	void DrawSign()
	{
		const rgb_color kColors[] = {{120, 120, 120, 255}, {60, 110, 190, 255}, {90, 150, 70, 255},
			{225, 160, 30, 255}, {195, 50, 45, 255}};
		const char* const kMarks[] = {"", "i", "?", "!", "\xc3\x97"};
		const alert_type type = fAlert->Type();
		const BRect sign(kStripeWidth - kIconSize / 2, kMargin, kStripeWidth + kIconSize / 2 - 1,
			kMargin + kIconSize - 1);
		SetHighColor(kColors[type]);
		FillEllipse(sign);

		BFont font(be_bold_font);
		font.SetSize(20);
		SetFont(&font);
		font_height height;
		font.GetHeight(&height);
		SetHighColor(255, 255, 255);
		SetDrawingMode(B_OP_OVER);
		DrawString(kMarks[type],
			BPoint((sign.left + sign.right - font.StringWidth(kMarks[type])) / 2,
				(sign.top + sign.bottom + height.ascent - height.descent) / 2));
		SetDrawingMode(B_OP_COPY);
	}

	const BAlert* fAlert;
};

} // namespace

/// What the thread in Go() waits for. The alert ends it, at the latest with itself.
struct BAlert::Outcome {
	BPrivate::UserWait wait;
	std::atomic<int32> answer{-1};
};


BAlert::BAlert()
	: BAlert("", "", NULL)
{
}


BAlert::BAlert(const char* title, const char* text, const char* button1, const char* button2,
	const char* button3, button_width width, alert_type type)
	: BAlert(title, text, button1, button2, button3, width, B_EVEN_SPACING, type)
{
}


BAlert::BAlert(const char* title, const char* text, const char* button1, const char* button2,
	const char* button3, button_width width, button_spacing spacing, alert_type type)
	: BWindow(BRect(0, 0, 100, 50), title, B_MODAL_WINDOW_LOOK, B_MODAL_APP_WINDOW_FEEL,
		B_NOT_RESIZABLE | B_NOT_CLOSABLE | B_NOT_ZOOMABLE | B_NOT_MINIMIZABLE),
	  fType(type),
	  fButtonWidth(width),
	  fSpacing(spacing),
	  fTextView(NULL),
	  fButtons(),
	  fShortcuts(),
	  fInvoker(NULL),
	  fAnswered(false)
{
	const char* const labels[kMostButtons] = {button1, button2, button3};
	Build(text, labels);
}


BAlert::BAlert(BMessage* archive)
	: BWindow(archive),
	  fType(B_INFO_ALERT),
	  fButtonWidth(B_WIDTH_AS_USUAL),
	  fSpacing(B_EVEN_SPACING),
	  fTextView(NULL),
	  fButtons(),
	  fShortcuts(),
	  fInvoker(NULL),
	  fAnswered(false)
{
	int32 number;
	if (archive->FindInt32("_atype", &number) == B_OK && number >= B_EMPTY_ALERT
		&& number <= B_STOP_ALERT)
		fType = static_cast<alert_type>(number);
	if (archive->FindInt32("_but_width", &number) == B_OK)
		fButtonWidth = EnumBetween(number, B_WIDTH_AS_USUAL, B_WIDTH_FROM_LABEL, fButtonWidth);
	const char* labels[kMostButtons] = {NULL, NULL, NULL};
	for (int32 i = 0; i < kMostButtons; i++) {
		if (archive->FindString("_but_label", i, &labels[i]) != B_OK)
			labels[i] = NULL;
		if (archive->FindInt32("_but_key", i, &number) == B_OK)
			fShortcuts[i] = static_cast<char>(number);
	}
	Build(archive->FindString("_text"), labels);
}


BAlert::~BAlert()
{
	// Whoever waits has its answer, or the alert was ended without one.
	if (fOutcome != NULL)
		fOutcome->wait.End();
}


BArchivable*
BAlert::Instantiate(BMessage* archive)
{
	return validate_instantiation(archive, "BAlert") ? new BAlert(archive) : NULL;
}


status_t
BAlert::Archive(BMessage* archive, bool) const
{
	// The views are made anew and are no part of the archive.
	status_t status = BWindow::Archive(archive, false);
	if (status == B_OK)
		status = archive->AddString("_text", fTextView->Text());
	if (status == B_OK)
		status = archive->AddInt32("_atype", fType);
	if (status == B_OK)
		status = archive->AddInt32("_but_width", fButtonWidth);
	for (int32 i = 0; i < kMostButtons && fButtons[i] != NULL && status == B_OK; i++) {
		status = archive->AddString("_but_label", fButtons[i]->Label());
		if (status == B_OK)
			status = archive->AddInt32("_but_key", fShortcuts[i]);
	}
	return status;
}


void
BAlert::MessageReceived(BMessage* message)
{
	int32 which;
	if (message->what == kMsgAnswer && message->FindInt32("which", &which) == B_OK)
		Answer(which);
	else
		BWindow::MessageReceived(message);
}


void
BAlert::FrameResized(float newWidth, float newHeight)
{
	BWindow::FrameResized(newWidth, newHeight);
}


void
BAlert::DispatchMessage(BMessage* message, BHandler* handler)
{
	int8 key;
	if (message->what == B_KEY_DOWN && message->FindInt8("byte", &key) == B_OK) {
		for (int32 i = 0; i < kMostButtons; i++) {
			if (fButtons[i] != NULL && fShortcuts[i] != 0 && fShortcuts[i] == key) {
				Answer(i);
				return;
			}
		}
	}
	BWindow::DispatchMessage(message, handler);
}


void
BAlert::Quit()
{
	BWindow::Quit();
}


bool
BAlert::QuitRequested()
{
	return BWindow::QuitRequested();
}


alert_type
BAlert::Type() const
{
	return fType;
}


void
BAlert::SetType(alert_type type)
{
	fType = type;
	LayOut();
}


void
BAlert::SetText(const char* text)
{
	fTextView->SetText(text);
	LayOut();
}


void
BAlert::SetButtonSpacing(button_spacing spacing)
{
	fSpacing = spacing;
	LayOut();
}


void
BAlert::SetButtonWidth(button_width width)
{
	fButtonWidth = width;
	LayOut();
}


void
BAlert::SetShortcut(int32 buttonIndex, char key)
{
	if (buttonIndex >= 0 && buttonIndex < kMostButtons)
		fShortcuts[buttonIndex] = key;
}


char
BAlert::Shortcut(int32 buttonIndex) const
{
	return buttonIndex >= 0 && buttonIndex < kMostButtons ? fShortcuts[buttonIndex] : 0;
}


int32
BAlert::Go()
{
	const auto outcome = std::make_shared<Outcome>();
	if (outcome->wait.InitCheck() != B_OK)
		return -1;
	fOutcome = outcome;
	Prepare();
	Show();

	// From here on the alert is its own thread's, and may be gone already.
	outcome->wait.Wait("an alert");
	return outcome->answer;
}


status_t
BAlert::Go(BInvoker* invoker)
{
	fInvoker = invoker;
	Prepare();
	Show();
	return B_OK;
}


BButton*
BAlert::ButtonAt(int32 index) const
{
	return index >= 0 && index < kMostButtons ? fButtons[index] : NULL;
}


BTextView*
BAlert::TextView() const
{
	return fTextView;
}


void
BAlert::Build(const char* text, const char* const labels[kMostButtons])
{
	AlertView* background = new AlertView(Bounds(), this);
	AddChild(background);
	fTextView = new BTextView(
		BRect(0, 0, 10, 10), "_tv_", BRect(0, 0, 10, 10), B_FOLLOW_LEFT_TOP, B_WILL_DRAW);
	background->AddChild(fTextView);
	fTextView->SetViewColor(background->ViewColor());
	fTextView->SetLowColor(background->ViewColor());
	const rgb_color color = ui_color(B_PANEL_TEXT_COLOR);
	fTextView->SetFontAndColor(be_plain_font, B_FONT_ALL, &color);
	fTextView->MakeEditable(false);
	fTextView->MakeSelectable(false);
	fTextView->SetText(text);

	for (int32 i = 0; i < kMostButtons; i++) {
		if (labels[i] != NULL && *labels[i] != '\0')
			AddButton(labels[i]);
	}
	LayOut();
}


/// Puts a button to the right of the others; it becomes the default one.
void
BAlert::AddButton(const char* label)
{
	int32 index = 0;
	while (fButtons[index] != NULL)
		index++;
	BMessage* pressed = new BMessage(kMsgAnswer);
	pressed->AddInt32("which", index);
	BButton* button = new BButton(BRect(0, 0, 10, 10), "_b_", label, pressed);
	button->SetTarget(this);
	ChildAt(0)->AddChild(button);
	button->MakeDefault(true);
	fButtons[index] = button;
}


/// The last things before the alert is shown.
void
BAlert::Prepare()
{
	if (fButtons[0] == NULL) {
		AddButton("OK");
		LayOut();
	}
	DefaultButton()->MakeFocus(true);
	Place();
}


/// Sizes the window for its text and buttons, and places them.
void
BAlert::LayOut()
{
	float widest = kUsualButtonWidth;
	float widths[kMostButtons] = {};
	float height = 0;
	for (int32 i = 0; i < kMostButtons; i++) {
		if (fButtons[i] == NULL)
			continue;
		float buttonHeight;
		fButtons[i]->GetPreferredSize(&widths[i], &buttonHeight);
		if (fButtonWidth == B_WIDTH_FROM_LABEL)
			widths[i] = std::ceil(fButtons[i]->StringWidth(fButtons[i]->Label())) + 24;
		else if (fButtonWidth == B_WIDTH_AS_USUAL)
			widths[i] = std::max(widths[i], kUsualButtonWidth);
		widest = std::max(widest, widths[i]);
		height = std::max(height, buttonHeight);
	}

	const float textLeft =
		fType == B_EMPTY_ALERT ? kMargin : kStripeWidth + kIconSize / 2 + kMargin;
	float buttons = kMargin;
	for (int32 i = 0; i < kMostButtons; i++) {
		if (fButtons[i] == NULL)
			continue;
		if (fButtonWidth == B_WIDTH_FROM_WIDEST)
			widths[i] = widest;
		buttons += widths[i] + kMargin;
	}
	if (fSpacing == B_OFFSET_SPACING)
		buttons += kOffsetGap;

	const float highest = BScreen(B_MAIN_SCREEN_ID).Frame().Height() / 2;
	float width = 0;
	float textHeight = 0;
	fTextView->MoveTo(textLeft, kMargin);
	for (float textWidth : kTextWidths) {
		width = std::max(textLeft + textWidth + kMargin, kStripeWidth + buttons);
		fTextView->ResizeTo(width - textLeft - kMargin, 10);
		fTextView->SetTextRect(fTextView->Bounds());
		textHeight = fTextView->TextHeight(0, fTextView->CountLines() - 1);
		if (textHeight <= highest)
			break;
	}
	textHeight = std::max(textHeight, kIconSize);
	fTextView->ResizeTo(width - textLeft - kMargin, textHeight);

	const float top = kMargin + textHeight + kMargin;
	ResizeTo(width, top + height + kMargin);
	float right = width - kMargin;
	for (int32 i = kMostButtons - 1; i >= 0; i--) {
		if (fButtons[i] == NULL)
			continue;
		if (i == 0 && fSpacing == B_OFFSET_SPACING)
			right -= kOffsetGap;
		float preferred;
		fButtons[i]->GetPreferredSize(NULL, &preferred);
		fButtons[i]->ResizeTo(widths[i], preferred);
		fButtons[i]->MoveTo(right - widths[i], top + (height - preferred) / 2);
		right -= widths[i] + kMargin;
	}
}


/// Centred, a little above the middle, over the calling window or on the screen.
void
BAlert::Place()
{
	BRect frame = BScreen(B_MAIN_SCREEN_ID).Frame();
	const BRect screen = frame;
	const BWindow* caller = dynamic_cast<BWindow*>(BLooper::LooperForThread(find_thread(NULL)));
	if (caller != NULL && !caller->IsHidden())
		frame = caller->Frame();
	const BRect bounds = Bounds();
	const float x = frame.left + (frame.Width() - bounds.Width()) / 2;
	const float y = frame.top + (frame.Height() - bounds.Height()) / 3;
	MoveTo(std::clamp(x, screen.left, std::max(screen.left, screen.right - bounds.Width())),
		std::clamp(y, screen.top, std::max(screen.top, screen.bottom - bounds.Height())));
}


/// A button was pressed: gives the answer to whoever wants it, and ends the alert.
void
BAlert::Answer(int32 index)
{
	if (fAnswered)
		return;
	fAnswered = true;

	if (fOutcome != NULL)
		fOutcome->answer = index;
	else if (fInvoker != NULL && fInvoker->Message() != NULL) {
		BMessage answer(*fInvoker->Message());
		answer.AddInt32("which", index);
		fInvoker->Invoke(&answer);
	}
	PostMessage(B_QUIT_REQUESTED);
}
