// SPDX-License-Identifier: MIT
// The folders at the left of a file panel that are a click away.

#include "interface/panel/PanelPlaces.h"

#include <FindDirectory.h>
#include <Message.h>
#include <Path.h>

#include "interface/panel/PanelItem.h"
#include "interface/panel/PanelPaths.h"
#include "interface/panel/PanelText.h"
#include "storage/XdgDirectories.h"

namespace BPrivate {

PanelPlaces::PanelPlaces(BRect frame)
	: BListView(frame, "places", B_SINGLE_SELECTION_LIST, B_FOLLOW_ALL_SIDES,
		B_WILL_DRAW | B_FRAME_EVENTS | B_NAVIGABLE)
{
	SetSelectionMessage(new BMessage(kMsgPlaceChosen));
}


PanelPlaces::~PanelPlaces()
{
	MakeEmpty();
}


void
PanelPlaces::SetPlaces(const std::vector<std::string>& recent)
{
	MakeEmpty();
	fPlaces.clear();
	AddPlace("Home", home_directory(), PanelIcon::kHome);
	BPath desktop;
	if (find_directory(B_DESKTOP_DIRECTORY, &desktop) == B_OK)
		AddPlace("Desktop", desktop.Path(), PanelIcon::kDesktop);
	AddPlace("Documents", xdg_user_directory("DOCUMENTS", "/Documents"), PanelIcon::kFolder);
	AddPlace("File system", "/", PanelIcon::kDisk);
	for (const std::string& folder : recent)
		AddPlace(DisplayName(LeafName(folder)), folder, PanelIcon::kFolder);
}


void
PanelPlaces::ShowFolder(const std::string& folder)
{
	for (int32 i = 0; i < CountItems(); i++) {
		if (fPlaces[i]->Path() == folder) {
			if (CurrentSelection() != i)
				Select(i);
			return;
		}
	}
	if (CurrentSelection() >= 0)
		DeselectAll();
}


std::string
PanelPlaces::ChosenFolder() const
{
	const int32 index = CurrentSelection();
	return index >= 0 ? fPlaces[index]->Path() : "";
}


/// Each folder once, and only those that are there.
void
PanelPlaces::AddPlace(const std::string& label, const std::string& path, PanelIcon icon)
{
	std::string folder;
	if (FindFolder(path, &folder) != B_OK)
		return;
	for (const std::unique_ptr<PlaceItem>& place : fPlaces) {
		if (place->Path() == folder)
			return;
	}
	fPlaces.push_back(std::make_unique<PlaceItem>(label, folder, icon));
	AddItem(fPlaces.back().get());
}

} // namespace BPrivate
