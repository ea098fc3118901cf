// SPDX-License-Identifier: MIT
// What the file panels of a program remember from one run to the next.
#ifndef INTERFACE_PANEL_MEMORY_H
#define INTERFACE_PANEL_MEMORY_H

#include <string>
#include <vector>

#include <SupportDefs.h>

namespace BPrivate {

/// The folders that files were chosen in, and the panels' size.
///
/// Kept in a file of the user's settings directory, one for each application. A file that is missing or
/// damaged counts as empty, and one that cannot be written is left alone: nothing here is worth a question.
class PanelMemory {
public:
	/// \a signature: the application's.
	explicit PanelMemory(const std::string& signature);

	status_t Load();
	status_t Save() const;

	/// The newest first; those that are gone are left out.
	std::vector<std::string> Folders() const;
	/// \a folder becomes the newest one. The oldest is forgotten when there are too many.
	void AddFolder(const std::string& folder);

	/// 0 until they are known.
	float Width() const { return fWidth; }
	float Height() const { return fHeight; }
	void SetSize(float width, float height);
	bool ShowsHidden() const { return fShowsHidden; }
	void SetShowsHidden(bool shows) { fShowsHidden = shows; }

private:
	std::string FilePath(bool create) const;

	std::string fName;
	std::vector<std::string> fFolders;
	float fWidth;
	float fHeight;
	bool fShowsHidden;
};

/// The name of the program's executable, for titles.
std::string ProgramName();
/// What the application's panels remember under.
std::string ApplicationSignature();

/// Where a panel begins that was given no folder: the current one. Programs that the desktop started have no
/// current folder of their own, but the home folder or the root: these begin where files were chosen last.
std::string StartFolder(const PanelMemory& memory);

} // namespace BPrivate

#endif // INTERFACE_PANEL_MEMORY_H
