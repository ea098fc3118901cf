// SPDX-License-Identifier: MIT
// The corners of rounded rects, made once for each radius.
#ifndef DISPLAY_QT_ROUNDED_SHAPE_H
#define DISPLAY_QT_ROUNDED_SHAPE_H

#include <vector>

#include <SupportDefs.h>

namespace BPrivate {

/// The coverage of a small rounded rect, which larger ones of whole pixels share: they have the same corners,
/// and between these the same pixel again and again.
class RoundedShape {
public:
	/// Whether shapes of these radii are kept.
	static bool IsKept(float xRadius, float yRadius);
	/// Stroked by a pen of one pixel, or filled. The calling thread's own, until it asks for the next one.
	static const RoundedShape& Of(float xRadius, float yRadius, bool stroked);

	/// The pixels of a corner in both directions, and the least width and height that a rect must have.
	int Corner() const { return fCorner; }
	int Side() const { return 2 * fCorner + 1; }
	/// Row \a y of a rect of \a height rows: the left corner, one pixel of the middle, the right corner.
	const uint8* Row(int y, int height) const;

private:
	RoundedShape(float xRadius, float yRadius, bool stroked);

	float fXRadius;
	float fYRadius;
	bool fStroked;
	int fCorner;
	std::vector<uint8> fCoverage;
};

} // namespace BPrivate

#endif // DISPLAY_QT_ROUNDED_SHAPE_H
