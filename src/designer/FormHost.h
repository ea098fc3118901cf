// SPDX-License-Identifier: MIT
// The project as its design forms see it.

#pragma once

#include <vector>

class TComponent;
class TDesignForm;

/// What a design form belongs to: it knows the other forms and hears of new names.
class TFormHost {
public:
	/// The forms of the project, in its order, as they are now. Any thread.
	///
	/// A form may be gone as soon as this returns: reach it through a WindowGuard, and leave it alone when
	/// that does not lock.
	virtual std::vector<TDesignForm*> Forms() const = 0;

	/// The project's file; empty when it was never saved. Any thread; see TProject::Filename().
	virtual const char* ProjectFile() const = 0;

	/// \a object, the application or a form, has a new name. Thread of the object's window, locked.
	virtual void ObjectNameChanged(TComponent* object) = 0;

protected:
	~TFormHost() = default;
};
