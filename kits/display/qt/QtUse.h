// SPDX-License-Identifier: MIT
// The use of Qt outside of the display's thread, and its end before Qt's static objects go.
#ifndef DISPLAY_QT_USE_H
#define DISPLAY_QT_USE_H

namespace BPrivate {

/// While it exists, Qt's static objects stay, unless it is false: then the program is ending and Qt must not
/// be used any more. May be nested.
///
/// Around all that draws with a QPainter, asks fonts or reads pictures in a thread that is not the display's.
/// Nothing may be waited for meanwhile that another thread does with Qt.
class QtUse {
public:
	QtUse();
	~QtUse();
	QtUse(const QtUse&) = delete;
	QtUse& operator=(const QtUse&) = delete;

	explicit operator bool() const { return fIsAllowed; }

	/// Refuses every use from here on, and waits, with a limit, for those of other threads to end.
	static void EndAll();

private:
	bool fIsAllowed;
};

} // namespace BPrivate

#endif // DISPLAY_QT_USE_H
