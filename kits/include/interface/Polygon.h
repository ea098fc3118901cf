// SPDX-License-Identifier: MIT
// A list of corners and the rect around them.
#ifndef _POLYGON_H
#define _POLYGON_H

#include <vector>

#include <Rect.h>

class BPolygon {
public:
	BPolygon();
	BPolygon(const BPoint* points, int32 count);
	BPolygon(const BPolygon& other);
	BPolygon(const BPolygon* other);
	virtual ~BPolygon();

	BPolygon& operator=(const BPolygon& other);

	/// The smallest rect around all corners; invalid without any.
	BRect Frame() const;
	void AddPoints(const BPoint* points, int32 count);
	int32 CountPoints() const;

	/// Moves and stretches the polygon so that \a source comes to lie on \a destination.
	void MapTo(BRect source, BRect destination);
	void PrintToStream() const;

private:
	friend class BView;

	void IncludeInFrame(size_t first);

	BRect fBounds;
	std::vector<BPoint> fPoints;
};

#endif // _POLYGON_H
