// SPDX-License-Identifier: MIT
// Images: the program, its libraries, and the add-ons that it loads.

#ifndef _IMAGE_H
#define _IMAGE_H

#include <sys/param.h>

#include <OS.h>

typedef int32 image_id;

typedef enum { B_APP_IMAGE = 1, B_LIBRARY_IMAGE, B_ADD_ON_IMAGE, B_SYSTEM_IMAGE } image_type;

typedef struct {
	image_id id;
	image_type type;
	int32 sequence;
	int32 init_order;
	void (*init_routine)();
	void (*term_routine)();
	dev_t device;
	ino_t node;
	char name[MAXPATHLEN];
	void* text;
	void* data;
	int32 text_size;
	int32 data_size;
	int32 api_version;
	int32 abi;
} image_info;

#define B_INIT_BEFORE_FUNCTION_NAME "initialize_before"
#define B_INIT_AFTER_FUNCTION_NAME "initialize_after"
#define B_TERM_BEFORE_FUNCTION_NAME "terminate_before"
#define B_TERM_AFTER_FUNCTION_NAME "terminate_after"

#define B_APP_IMAGE_SYMBOL ((void*)(addr_t)0)
#define B_CURRENT_IMAGE_SYMBOL ((void*)(addr_t)1)

#define B_SYMBOL_TYPE_DATA 0x1
#define B_SYMBOL_TYPE_TEXT 0x2
#define B_SYMBOL_TYPE_ANY 0x5

/// Starts a program in a process of its own, suspended until resume_thread() or wait_for_thread().
///
/// \a argv: \a argc texts, the first the program's path. Returns the id of its main thread;
/// B_BAD_VALUE, or what load_add_on() returns for a file that cannot be run.
thread_id load_image(int32 argc, const char** argv, const char** environ);

/// Loads an add-on, or counts one that is loaded already; each load needs its unload_add_on().
///
/// Returns an id above 0; B_ENTRY_NOT_FOUND, B_NOT_AN_EXECUTABLE, B_MISSING_SYMBOL,
/// B_MISSING_LIBRARY, B_BAD_VALUE for a null path, or B_ERROR. What the host said is printed to the
/// error output when BE_LOAD_VERBOSE is in the environment.
image_id load_add_on(const char* path);
/// B_BAD_IMAGE_ID for what is no loaded add-on.
status_t unload_add_on(image_id image);

/// \a symbolType: a function, a variable or either. Only what the image itself defines is found.
/// B_OK, B_BAD_IMAGE_ID, B_BAD_VALUE for a null pointer, or B_ENTRY_NOT_FOUND.
status_t get_image_symbol(
	image_id image, const char* name, int32 symbolType, void** _symbolLocation);
/// \a n: from 0. \a _nameLength: the size of \a nameBuffer, then the length of the name, which is
/// cut to fit. Any result pointer may be null. B_BAD_INDEX after the last symbol.
status_t get_nth_image_symbol(image_id image, int32 n, char* nameBuffer, int32* _nameLength,
	int32* _symbolType, void** _symbolLocation);

/// B_BAD_IMAGE_ID for an image that is not there.
status_t get_image_info(image_id image, image_info* info);
/// \a cookie: 0 before the first call. \a team: this one only. B_BAD_VALUE after the last image.
status_t get_next_image_info(team_id team, int32* cookie, image_info* info);

#endif // _IMAGE_H
