// SPDX-License-Identifier: MIT
// Objects that can be kept in a message, and made again from it.

#ifndef _ARCHIVABLE_H
#define _ARCHIVABLE_H

#include <image.h>

class BArchivable;
class BMessage;

/// Makes an object from an archive.
typedef BArchivable* (*instantiation_func)(BMessage* archive);

/// An object that can be kept in a message. The field "class" of an archive names its class.
class BArchivable {
public:
	BArchivable();
	BArchivable(BMessage* from);
	virtual ~BArchivable();

	/// Adds the object's state to \a into; here only the class name, unless there is one already.
	/// B_BAD_VALUE for a null message.
	virtual status_t Archive(BMessage* into, bool deep = true) const;
	/// A new object, the caller's. A plain BArchivable cannot be made: null.
	static BArchivable* Instantiate(BMessage* archive);
};


/// The one thing of the unarchiver that other classes' signatures name.
class BUnarchiver {
public:
	enum ownership_policy { B_ASSUME_OWNERSHIP, B_DONT_ASSUME_OWNERSHIP };
};


/// Makes the object that \a from is the archive of, by the first of its class names that is known
/// to the program or its libraries and has an Instantiate() function.
///
/// Returns a new object, the caller's, or null. \a id, unless null, is set to the image that the
/// function was found in, or to a negative status.
BArchivable* instantiate_object(BMessage* from, image_id* id);
BArchivable* instantiate_object(BMessage* from);

/// Whether \a from is an archive of \a className (any of its levels of derivation).
bool validate_instantiation(BMessage* from, const char* className);

/// The Instantiate() function of a class, null when there is none. Only what is loaded is looked at:
/// \a signature makes no difference.
instantiation_func find_instantiation_func(const char* className, const char* signature);
instantiation_func find_instantiation_func(const char* className);
instantiation_func find_instantiation_func(BMessage* archive);

#endif // _ARCHIVABLE_H
