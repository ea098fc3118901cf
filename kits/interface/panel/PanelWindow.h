// SPDX-License-Identifier: MIT
// The window of a file panel.
#ifndef INTERFACE_PANEL_WINDOW_H
#define INTERFACE_PANEL_WINDOW_H

#include <functional>
#include <memory>
#include <string>
#include <vector>

#include <FilePanel.h>
#include <Messenger.h>
#include <Size.h>
#include <Window.h>

#include "interface/panel/PanelList.h"

class BButton;
class BCheckBox;
class BScrollView;
class BStringView;
class BTextControl;

namespace BPrivate {

class PanelHeader;
class PanelPlaces;
struct PanelLink;

/// Lets the user walk through folders and choose. Outlives its panel by the time that it takes to quit.
///
/// Views that programs know by name: "PoseView" (the list), "text view" (the name), "default button" and
/// "cancel button".
class PanelWindow : public BWindow, private PanelListListener {
public:
	PanelWindow(file_panel_mode mode, bool multiple, bool modal, std::shared_ptr<PanelLink> link);

	void MessageReceived(BMessage* message) override;
	void DispatchMessage(BMessage* message, BHandler* handler) override;
	bool QuitRequested() override;
	void WindowActivated(bool active) override;
	void Show() override;
	void Hide() override;

private:
	// Views
	void Build(bool multiple);
	BButton* AddButton(const char* name, const char* label, uint32 what, uint32 resizingMode);
	void BuildTop();
	void BuildMiddle(bool multiple);
	void BuildBottom();
	void LayOut();
	void AddShortcuts();
	void Place();

	// Listener of the list
	void EntriesSelected() override;
	void EntriesChanged() override;

	// What the panel tells
	bool HandlePanelMessage(BMessage* message);
	void ShowPanel();
	void HidePanel();
	void SetButtonLabel(const BMessage& message);
	void SetSaveText(const std::string& text);
	void SetRules();
	void CallPanel(const std::function<void(BFilePanel*)>& hook);

	// What the user does
	void HandleDrop(const BMessage& message);
	void SetOrder(const BMessage& message);
	bool HandleKey(const BMessage& message);
	bool HandleFocusKey(int32 key, bool isCommand);
	void GoTo(const std::string& folder, const std::string& select = "");
	bool TryFolder(const std::string& path, const std::string& select = "");
	void GoUp();
	void GoToTypedPath();
	void EditPath(const std::string& text);
	void PathEdited();
	void AskForFolderName();
	void FolderMade(const BMessage& message);

	// Choosing
	bool IsWanted(const FolderEntry& entry) const;
	bool IsFolderWanted() const;
	bool EnterSelected(bool evenWanted);
	void Invoked();
	void Choose();
	void OpenChosen();
	void ChooseFolder();
	void SaveChosen();
	void SaveAs(const std::string& folder, const std::string& name);
	void ReplaceAnswered(const BMessage& answer);
	void SendChoice(BMessage* message);
	void SendCancel();

	// What is shown
	void UpdateFolder();
	void UpdateState();
	void UpdateStatus();
	void UpdateMemory(bool chosen);
	void Notice(const std::string& text);
	void CloseDialogs();
	bool IsSaving() const { return fMode == B_SAVE_PANEL; }

	const file_panel_mode fMode;
	const std::shared_ptr<PanelLink> fLink;
	BView* fBackground;
	BButton* fUpButton;
	BTextControl* fPath;
	BButton* fFolderButton;
	PanelPlaces* fPlaces;
	BScrollView* fPlacesScroll;
	PanelHeader* fHeader;
	PanelList* fList;
	BScrollView* fListScroll;
	BTextControl* fName;
	BCheckBox* fHiddenBox;
	BStringView* fStatus;
	BButton* fCancelButton;
	BButton* fDefaultButton;

	bool fPlaced;
	// The size that it got without the user.
	BSize fPlacedSize;
	size_t fPathLength;
	std::string fShownFolder;
	// The proposed name as it was given, which may be no text.
	std::string fSaveName;
	std::string fNotice;
	BMessenger fAlert;
	BMessenger fNameWindow;
};

} // namespace BPrivate

#endif // INTERFACE_PANEL_WINDOW_H
