// SPDX-License-Identifier: MIT
// An outline of straight and curved pieces.
#ifndef _SHAPE_H
#define _SHAPE_H

#include <memory>

#include <Archivable.h>
#include <Rect.h>

namespace BPrivate {
struct CanvasPath;
} // namespace BPrivate

/// A value: copies have outlines of their own.
class BShape : public BArchivable {
public:
	BShape();
	BShape(const BShape& other);
	BShape(BMessage* archive);
	virtual ~BShape();

	BShape& operator=(const BShape& other);
	bool operator==(const BShape& other) const;
	bool operator!=(const BShape& other) const { return !(*this == other); }

	static BArchivable* Instantiate(BMessage* archive);
	virtual status_t Archive(BMessage* archive, bool deep = true) const override;

	void Clear();
	/// The smallest rect around all points, control points included; invalid when empty.
	BRect Bounds() const;

	/// Appends the pieces of \a other. Returns B_OK; B_BAD_VALUE for null.
	status_t AddShape(const BShape* other);
	/// Starts a new outline; without it the first starts at (0, 0). All return B_OK.
	status_t MoveTo(BPoint point);
	status_t LineTo(BPoint linePoint);
	status_t BezierTo(BPoint controlPoints[3]);
	status_t BezierTo(const BPoint& control1, const BPoint& control2, const BPoint& endPoint);
	status_t Close();

private:
	friend class BView;

	void NeedStart();

	std::unique_ptr<BPrivate::CanvasPath> fPath;
};

#endif // _SHAPE_H
