// SPDX-License-Identifier: MIT
// Knowing whether a property still exists.

#pragma once

class TProperty;

/// Refers to a property, and to none from the moment at which the property is destroyed.
///
/// What edits a property at a later time, such as a dialog, keeps one of these in place of a plain pointer.
/// Any thread may use a watch; the property stays while the window of its component's form is locked, so
/// lock that before asking for it.
class TPropertyWatch {
public:
	/// \a property: exists now, or null.
	explicit TPropertyWatch(TProperty* property = nullptr);
	~TPropertyWatch();

	TPropertyWatch(const TPropertyWatch&) = delete;
	TPropertyWatch& operator=(const TPropertyWatch&) = delete;

	void SetTo(TProperty* property);
	/// To the property of \a other, if that still exists.
	void SetTo(const TPropertyWatch& other);

	/// Null when there was none, or it is gone.
	TProperty* Property() const;

private:
	friend class TProperty;
	static void PropertyGone(const TProperty* property);

	TProperty* fProperty;
	TPropertyWatch* fPrevious;
	TPropertyWatch* fNext;
};
