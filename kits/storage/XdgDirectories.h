// SPDX-License-Identifier: MIT
// Where the user's folders are by the XDG conventions.

#ifndef _XDG_DIRECTORIES_H
#define _XDG_DIRECTORIES_H

#include <string>
#include <vector>

namespace BPrivate {

/// $HOME, or what the system's list of users says; "/" at last.
std::string home_directory();

/// $XDG_CONFIG_HOME, $XDG_DATA_HOME, $XDG_CACHE_HOME and $XDG_STATE_HOME, or their defaults in the
/// home folder. Values that are not absolute count as unset, as the conventions want it.
std::string xdg_config_home();
std::string xdg_data_home();
std::string xdg_cache_home();
std::string xdg_state_home();

/// A folder of user-dirs.dirs, such as "DESKTOP"; \a fallback in the home folder otherwise.
std::string xdg_user_directory(const char* name, const char* fallback);

/// The folders of data in the order of their precedence: the user's own, the share folder beside the
/// running program's bin folder, then $XDG_DATA_DIRS.
std::vector<std::string> xdg_data_directories();

} // namespace BPrivate

#endif
