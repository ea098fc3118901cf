// SPDX-License-Identifier: MIT
// The rows of a file panel: files in its list, and places beside it.
#ifndef INTERFACE_PANEL_ITEM_H
#define INTERFACE_PANEL_ITEM_H

#include <string>

#include <StringItem.h>

#include "interface/panel/FolderReader.h"
#include "interface/panel/PanelIcons.h"

namespace BPrivate {

/// An entry of the folder: icon, name, size and time. Its text is the shown name, so that typing finds it.
class PanelItem : public BStringItem {
public:
	/// \a entry must outlive the item.
	explicit PanelItem(const FolderEntry* entry);

	const FolderEntry& Entry() const { return *fEntry; }

	void DrawItem(BView* owner, BRect frame, bool complete = false) override;
	void Update(BView* owner, const BFont* font) override;

private:
	const FolderEntry* fEntry;
};


/// A folder that is a click away.
class PlaceItem : public BStringItem {
public:
	PlaceItem(const std::string& label, const std::string& path, PanelIcon icon);

	const std::string& Path() const { return fPath; }

	void DrawItem(BView* owner, BRect frame, bool complete = false) override;
	void Update(BView* owner, const BFont* font) override;

private:
	const std::string fPath;
	const PanelIcon fIcon;
};

} // namespace BPrivate

#endif // INTERFACE_PANEL_ITEM_H
