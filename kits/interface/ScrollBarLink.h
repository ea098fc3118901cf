// SPDX-License-Identifier: MIT
// What a view asks of the scroll bars that target it.
#ifndef INTERFACE_SCROLL_BAR_LINK_H
#define INTERFACE_SCROLL_BAR_LINK_H

class BScrollBar;

namespace BPrivate {

/// A scroll bar as its target sees it. The bar's own; it takes itself out of the view before it goes.
class ScrollBarLink {
public:
	virtual BScrollBar* ScrollBar() = 0;
	/// The places that the target may be scrolled to, view coordinates.
	virtual void GetRange(float* minimum, float* maximum) const = 0;
	/// The target was scrolled; the bar shows it and does not scroll the target again.
	virtual void TargetScrolled(float value) = 0;
	/// The wheel was turned by \a delta notches, positive towards the end.
	virtual void WheelTurned(float delta) = 0;
	/// The target is about to go; the bar forgets it.
	virtual void TargetGone() = 0;

protected:
	~ScrollBarLink() = default;
};

} // namespace BPrivate

#endif // INTERFACE_SCROLL_BAR_LINK_H
