// SPDX-License-Identifier: MIT
// The folders at the left of a file panel that are a click away.
#ifndef INTERFACE_PANEL_PLACES_H
#define INTERFACE_PANEL_PLACES_H

#include <memory>
#include <string>
#include <vector>

#include <ListView.h>

#include "interface/panel/PanelIcons.h"

namespace BPrivate {

class PlaceItem;

/// The home folder, the desktop and so on, and the folders that were used last. Sends its window
/// kMsgPlaceChosen when another one is chosen.
class PanelPlaces : public BListView {
public:
	explicit PanelPlaces(BRect frame);
	~PanelPlaces() override;

	/// The fixed places, then \a recent.
	void SetPlaces(const std::vector<std::string>& recent);
	/// The place for \a folder is the selected one; none where there is none.
	void ShowFolder(const std::string& folder);
	/// The path of the selected place, or an empty text.
	std::string ChosenFolder() const;

private:
	void AddPlace(const std::string& label, const std::string& path, PanelIcon icon);

	std::vector<std::unique_ptr<PlaceItem>> fPlaces;
};

constexpr uint32 kMsgPlaceChosen = '_PPl';

} // namespace BPrivate

#endif // INTERFACE_PANEL_PLACES_H
