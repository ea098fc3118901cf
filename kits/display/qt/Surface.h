// SPDX-License-Identifier: MIT
// A window's finished picture, between the thread that draws it and the one that shows it.
#ifndef DISPLAY_QT_SURFACE_H
#define DISPLAY_QT_SURFACE_H

#include <memory>
#include <mutex>

#include <QImage>
#include <QRegion>

#include "display/PixelBuffer.h"

class BRegion;

namespace BPrivate {

class QtCanvas;
class WindowPixels;

/// Any thread; the lock is held while pixels are copied, and no longer.
class Surface {
public:
	/// Takes over \a region (whole pixels of the API) of \a canvas. True when the display thread has
	/// to be told: nothing was waiting to be shown before.
	bool Take(const QtCanvas& canvas, const BRegion& region);

	/// What changed since the last call, in window coordinates, rounded outwards.
	QRegion TakeDamage();

	/// Calls \a painter with the picture, which is empty before the first Take(), and the memory that it is in.
	template <typename Painter>
	void Paint(Painter painter) const
	{
		std::lock_guard<std::mutex> lock(fMutex);
		painter(fImage, fPixels);
	}

	Picture Copy() const;

	/// Nothing has changed for a while: gives back memory that drawing needs and showing does not.
	void Rest();

private:
	void CopyRect(const PixelBuffer& from, const QRect& device);

	mutable std::mutex fMutex;
	/// The last canvas's; it may be gone.
	std::shared_ptr<WindowPixels> fPixels;
	/// The finished ones of these. Device pixels; its device pixel ratio is the canvas's scale.
	QImage fImage;
	QRegion fDamage;
};

} // namespace BPrivate

#endif // DISPLAY_QT_SURFACE_H
