// SPDX-License-Identifier: MIT
// A window's finished picture, between the thread that draws it and the one that shows it.
#include "display/qt/Surface.h"

#include <cstring>

#include <Region.h>

#include "display/WindowPixels.h"
#include "display/qt/QtCanvas.h"
#include "display/qt/QtUse.h"

namespace BPrivate {

bool
Surface::Take(const QtCanvas& canvas, const BRegion& region)
{
	const PixelBuffer& buffer = canvas.Buffer();
	QRect all(0, 0, buffer.width, buffer.height);
	const std::shared_ptr<WindowPixels>& pixels = canvas.Pixels();
	const QtUse use;
	if (pixels == nullptr || !use)
		return false;

	std::lock_guard<std::mutex> lock(fMutex);
	bool wasClean = fDamage.isEmpty();
	if (fPixels != pixels) {
		fImage = QImage(reinterpret_cast<uchar*>(pixels->Finished()), buffer.width, buffer.height,
			buffer.bytesPerRow, QImage::Format_RGB32);
		fImage.setDevicePixelRatio(canvas.Scale());
		fPixels = pixels;
		CopyRect(buffer, all);
		fPixels->End();
		fDamage = QRegion(0, 0, canvas.Width(), canvas.Height());
		return wasClean;
	}

	for (int32 i = 0; i < region.CountRects(); i++) {
		clipping_rect rect = region.RectAtInt(i);
		QRect device = canvas.DeviceRect(rect.left, rect.top, rect.right, rect.bottom) & all;
		if (device.isEmpty())
			continue;
		CopyRect(buffer, device);
		fDamage += QRect(QPoint(rect.left, rect.top), QPoint(rect.right, rect.bottom));
	}
	fPixels->End();
	return wasClean && !fDamage.isEmpty();
}


void
Surface::CopyRect(const PixelBuffer& from, const QRect& device)
{
	size_t bytes = static_cast<size_t>(device.width()) * 4;
	for (int y = device.top(); y <= device.bottom(); y++) {
		const uint8* source = static_cast<const uint8*>(from.bits)
			+ static_cast<size_t>(y) * from.bytesPerRow + device.left() * 4;
		memcpy(fImage.scanLine(y) + device.left() * 4, source, bytes);
	}
}


QRegion
Surface::TakeDamage()
{
	std::lock_guard<std::mutex> lock(fMutex);
	QRegion damage;
	damage.swap(fDamage);
	return damage;
}


Picture
Surface::Copy() const
{
	std::lock_guard<std::mutex> lock(fMutex);
	Picture picture{fImage.width(), fImage.height(), false, {}};
	picture.pixels.reserve(static_cast<size_t>(picture.width) * picture.height);
	for (int y = 0; y < picture.height; y++) {
		auto row = reinterpret_cast<const uint32*>(fImage.constScanLine(y));
		picture.pixels.insert(picture.pixels.end(), row, row + picture.width);
	}
	return picture;
}


void
Surface::Rest()
{
	std::lock_guard<std::mutex> lock(fMutex);
	if (fPixels != nullptr)
		fPixels->Rest();
}

} // namespace BPrivate
