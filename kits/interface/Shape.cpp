// SPDX-License-Identifier: MIT
// BShape: an outline, piece by piece.
#include <Shape.h>

#include <Errors.h>
#include <Message.h>

#include "display/Canvas.h"

using BPrivate::CanvasPath;

namespace {

size_t
PointsOf(CanvasPath::Kind kind)
{
	if (kind == CanvasPath::kClose)
		return 0;
	return kind == CanvasPath::kBezierTo ? 3 : 1;
}

} // namespace


BShape::BShape()
	: fPath(std::make_unique<CanvasPath>())
{
}


BShape::BShape(const BShape& other)
	: BArchivable(),
	  fPath(std::make_unique<CanvasPath>(*other.fPath))
{
}


// Pieces whose points are missing end the shape.
BShape::BShape(BMessage* archive)
	: BArchivable(archive),
	  fPath(std::make_unique<CanvasPath>())
{
	int32 kind;
	BPoint point;
	int32 nextPoint = 0;
	for (int32 i = 0; archive->FindInt32("_kinds", i, &kind) == B_OK; i++) {
		if (kind < CanvasPath::kMoveTo || kind > CanvasPath::kClose)
			return;
		auto piece = static_cast<CanvasPath::Kind>(kind);
		size_t count = PointsOf(piece);
		size_t before = fPath->points.size();
		while (count-- > 0) {
			if (archive->FindPoint("_points", nextPoint++, &point) != B_OK) {
				fPath->points.resize(before);
				return;
			}
			fPath->points.push_back(point);
		}
		fPath->kinds.push_back(piece);
	}
}


BShape::~BShape() = default;


BShape&
BShape::operator=(const BShape& other)
{
	*fPath = *other.fPath;
	return *this;
}


bool
BShape::operator==(const BShape& other) const
{
	return fPath->kinds == other.fPath->kinds && fPath->points == other.fPath->points;
}


BArchivable*
BShape::Instantiate(BMessage* archive)
{
	return validate_instantiation(archive, "BShape") ? new BShape(archive) : nullptr;
}


status_t
BShape::Archive(BMessage* archive, bool deep) const
{
	status_t status = BArchivable::Archive(archive, deep);
	for (size_t i = 0; status == B_OK && i < fPath->kinds.size(); i++)
		status = archive->AddInt32("_kinds", fPath->kinds[i]);
	for (size_t i = 0; status == B_OK && i < fPath->points.size(); i++)
		status = archive->AddPoint("_points", fPath->points[i]);
	return status;
}


void
BShape::Clear()
{
	fPath->kinds.clear();
	fPath->points.clear();
}


BRect
BShape::Bounds() const
{
	if (fPath->points.empty())
		return BRect();
	BRect bounds(fPath->points[0], fPath->points[0]);
	for (BPoint point : fPath->points)
		bounds = bounds | BRect(point, point);
	return bounds;
}


status_t
BShape::AddShape(const BShape* other)
{
	if (other == nullptr)
		return B_BAD_VALUE;
	CanvasPath added(*other->fPath);
	fPath->kinds.insert(fPath->kinds.end(), added.kinds.begin(), added.kinds.end());
	fPath->points.insert(fPath->points.end(), added.points.begin(), added.points.end());
	return B_OK;
}


status_t
BShape::MoveTo(BPoint point)
{
	fPath->MoveTo(point);
	return B_OK;
}


status_t
BShape::LineTo(BPoint linePoint)
{
	NeedStart();
	fPath->LineTo(linePoint);
	return B_OK;
}


status_t
BShape::BezierTo(BPoint controlPoints[3])
{
	return BezierTo(controlPoints[0], controlPoints[1], controlPoints[2]);
}


status_t
BShape::BezierTo(const BPoint& control1, const BPoint& control2, const BPoint& endPoint)
{
	NeedStart();
	fPath->BezierTo(control1, control2, endPoint);
	return B_OK;
}


status_t
BShape::Close()
{
	if (!fPath->kinds.empty() && fPath->kinds.back() != CanvasPath::kClose)
		fPath->Close();
	return B_OK;
}


void
BShape::NeedStart()
{
	if (fPath->kinds.empty())
		fPath->MoveTo(B_ORIGIN);
}
