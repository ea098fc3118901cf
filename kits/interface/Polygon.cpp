// SPDX-License-Identifier: MIT
// BPolygon: corners and their frame.
#include <Polygon.h>

#include <cstdio>

BPolygon::BPolygon() = default;


BPolygon::BPolygon(const BPoint* points, int32 count)
{
	AddPoints(points, count);
}


BPolygon::BPolygon(const BPolygon& other) = default;


BPolygon::BPolygon(const BPolygon* other)
{
	if (other != nullptr)
		*this = *other;
}


BPolygon::~BPolygon() = default;


BPolygon& BPolygon::operator=(const BPolygon& other) = default;


BRect
BPolygon::Frame() const
{
	return fBounds;
}


void
BPolygon::AddPoints(const BPoint* points, int32 count)
{
	if (points == nullptr || count <= 0)
		return;

	size_t first = fPoints.size();
	fPoints.insert(fPoints.end(), points, points + count);
	IncludeInFrame(first);
}


int32
BPolygon::CountPoints() const
{
	return static_cast<int32>(fPoints.size());
}


void
BPolygon::MapTo(BRect source, BRect destination)
{
	// A source without extent has one place to go to: the left or top side.
	float scaleX = source.Width() != 0 ? destination.Width() / source.Width() : 0;
	float scaleY = source.Height() != 0 ? destination.Height() / source.Height() : 0;
	for (BPoint& point : fPoints) {
		point.x = destination.left + (point.x - source.left) * scaleX;
		point.y = destination.top + (point.y - source.top) * scaleY;
	}
	IncludeInFrame(0);
}


void
BPolygon::PrintToStream() const
{
	for (const BPoint& point : fPoints)
		point.PrintToStream();
}


void
BPolygon::IncludeInFrame(size_t first)
{
	for (size_t i = first; i < fPoints.size(); i++) {
		BRect point(fPoints[i], fPoints[i]);
		fBounds = i == 0 ? point : fBounds | point;
	}
}
