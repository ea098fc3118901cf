// SPDX-License-Identifier: MIT
// How much of each pixel a shape covers.
#ifndef DISPLAY_QT_MASK_H
#define DISPLAY_QT_MASK_H

#include <QImage>
#include <QRect>

#include <SupportDefs.h>

namespace BPrivate {

/// Coverage, 0 to 255, of the device pixels in a rectangle of a buffer. Empty for an empty rectangle.
class Mask {
public:
	explicit Mask(const QRect& area);

	bool IsEmpty() const { return fImage.isNull(); }
	const QRect& Area() const { return fArea; }
	/// To paint on: device pixels, the area's left-top at (0, 0).
	QImage& Image() { return fImage; }

	/// The coverage from column \a x on; inside the area.
	const uint8* Row(int x, int y) const;
	/// Covers a pixel wholly; outside of the area nothing happens.
	void Set(int x, int y);
	/// A line one pixel wide that covers both of its ends.
	void AddLine(QPoint from, QPoint to);

private:
	QRect fArea;
	QImage fImage;
};

} // namespace BPrivate

#endif // DISPLAY_QT_MASK_H
