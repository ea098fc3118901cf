// SPDX-License-Identifier: MIT
// Tests of BPicture and BShape: what is recorded is drawn again, here or from a file; damage is told.
#include <Picture.h>

#include <Bitmap.h>
#include <DataIO.h>
#include <Message.h>
#include <Polygon.h>
#include <Region.h>
#include <Shape.h>

#include "InterfaceFixture.h"
#include "support/Printers.h"

namespace {

const rgb_color kRed = {255, 0, 0, 255};


// Two bitmaps of 20 x 20: one is drawn into, the other gets the picture of it.
class PictureTest : public InterfaceTest {
protected:
	void SetUp() override
	{
		for (int i = 0; i < 2; i++) {
			fBitmaps[i] = std::make_unique<BBitmap>(BRect(0, 0, 19, 19), B_RGB32, true);
			fViews[i] = new BView(fBitmaps[i]->Bounds(), "view", B_FOLLOW_NONE, B_WILL_DRAW);
			fBitmaps[i]->AddChild(fViews[i]);
		}
	}

	void DrawAll(BView* view)
	{
		BPoint corners[] = {{2, 2}, {17, 4}, {9, 17}};
		BBitmap small(BRect(0, 0, 3, 3), B_RGB32);
		BRegion region(BRect(12, 12, 14, 14));
		view->PushState();
		view->SetHighColor(kRed);
		view->FillRect(BRect(1, 1, 4, 4));
		view->SetPenSize(2);
		view->StrokeRect(BRect(6, 1, 12, 6));
		view->SetPenSize(1);
		view->StrokeLine(BPoint(0, 19), BPoint(19, 19), B_MIXED_COLORS);
		view->FillEllipse(BRect(1, 8, 8, 14));
		view->StrokeEllipse(BRect(10, 8, 18, 14));
		view->FillRoundRect(BRect(12, 15, 18, 18), 2, 2);
		view->StrokeRoundRect(BRect(0, 0, 19, 18), 3, 3);
		view->StrokeArc(BRect(3, 3, 16, 16), 0, 90);
		view->FillArc(BRect(3, 3, 16, 16), 180, 45);
		view->StrokePolygon(corners, 3);
		view->BeginLineArray(1);
		view->AddLine(BPoint(0, 0), BPoint(9, 0), make_color(0, 0, 255));
		view->EndLineArray();
		view->FillRegion(&region);
		view->InvertRect(BRect(15, 0, 18, 3));
		view->DrawBitmap(&small, BPoint(8, 8));
		view->DrawString("x", BPoint(2, 12));
		BRegion clip(BRect(0, 0, 9, 9));
		view->ConstrainClippingRegion(&clip);
		view->SetOrigin(3, 3);
		view->FillRect(BRect(4, 4, 15, 15));
		view->PopState();
	}

	void Record(BPicture* picture)
	{
		fBitmaps[0]->Lock();
		fViews[0]->BeginPicture(picture);
		DrawAll(fViews[0]);
		EXPECT_EQ(fViews[0]->EndPicture(), picture);
		EXPECT_EQ(fViews[0]->EndPicture(), nullptr);
		fBitmaps[0]->Unlock();
	}

	void Play(const BPicture& picture, BPoint where = B_ORIGIN)
	{
		fBitmaps[1]->Lock();
		fViews[1]->DrawPicture(&picture, where);
		fBitmaps[1]->Unlock();
	}

	bool IsWhite(int index)
	{
		const auto* pixels = static_cast<const uint32*>(fBitmaps[index]->Bits());
		return std::all_of(
			pixels, pixels + 400, [](uint32 pixel) { return (pixel & 0xffffff) == 0xffffff; });
	}

	bool AreSame()
	{
		return memcmp(fBitmaps[0]->Bits(), fBitmaps[1]->Bits(), fBitmaps[0]->BitsLength()) == 0;
	}

	std::unique_ptr<BBitmap> fBitmaps[2];
	BView* fViews[2];
};

} // namespace


TEST_F(PictureTest, RecordingDrawsNothingAndPlayingDrawsTheSame)
{
	BPicture picture;
	Record(&picture);
	EXPECT_TRUE(IsWhite(0));
	Play(picture);
	EXPECT_FALSE(IsWhite(1));

	fBitmaps[0]->Lock();
	DrawAll(fViews[0]);
	fBitmaps[0]->Unlock();
	EXPECT_TRUE(AreSame());
}


TEST_F(PictureTest, AFlattenedPictureIsTheSame)
{
	BPicture picture, read;
	Record(&picture);
	BMallocIO stream;
	ASSERT_EQ(picture.Flatten(&stream), B_OK);
	stream.Seek(0, SEEK_SET);
	ASSERT_EQ(read.Unflatten(&stream), B_OK);
	Play(read);
	fBitmaps[0]->Lock();
	fViews[0]->DrawPicture(&picture, B_ORIGIN);
	fBitmaps[0]->Unlock();
	EXPECT_FALSE(IsWhite(1));
	EXPECT_TRUE(AreSame());
}


TEST_F(PictureTest, DamagedPicturesAreRefused)
{
	BPicture picture;
	Record(&picture);
	BMallocIO stream;
	ASSERT_EQ(picture.Flatten(&stream), B_OK);
	std::string whole(static_cast<const char*>(stream.Buffer()), stream.BufferLength());
	for (size_t length = 0; length < whole.size(); length += 7) {
		BMemoryIO part(whole.data(), length);
		BPicture read;
		EXPECT_NE(read.Unflatten(&part), B_OK) << length;
	}
	// Bytes that say anything: nothing is read beyond the end, whatever they mean.
	for (size_t i = 8; i < whole.size(); i++) {
		std::string damaged = whole;
		damaged[i] = static_cast<char>(damaged[i] ^ 0xff);
		BMemoryIO all(damaged.data(), damaged.size());
		BPicture read;
		read.Unflatten(&all);
	}
	BPicture none;
	EXPECT_EQ(none.Unflatten(nullptr), B_BAD_VALUE);
	BMemoryIO text("this is no picture at all", 25);
	EXPECT_EQ(none.Unflatten(&text), B_BAD_DATA);
}


TEST_F(PictureTest, AStateThatDoesNotExistIsRefused)
{
	BPicture picture;
	fBitmaps[0]->Lock();
	fViews[0]->BeginPicture(&picture);
	fViews[0]->SetDrawingMode(B_OP_ALPHA);
	fViews[0]->SetBlendingMode(B_CONSTANT_ALPHA, B_ALPHA_COMPOSITE);
	fViews[0]->SetPenSize(7);
	fViews[0]->FillRect(BRect(1, 1, 4, 4));
	fViews[0]->EndPicture();
	fBitmaps[0]->Unlock();
	BMallocIO stream;
	ASSERT_EQ(picture.Flatten(&stream), B_OK);
	const std::string whole(static_cast<const char*>(stream.Buffer()), stream.BufferLength());

	const struct {
		int32 mode = B_OP_ALPHA;
		int32 alphaSource = B_CONSTANT_ALPHA;
		int32 alphaFunction = B_ALPHA_COMPOSITE;
		float penSize = 7;
		int32 lineCap = B_BUTT_CAP;
		int32 lineJoin = B_MITER_JOIN;
	} kState;
	const size_t place =
		whole.rfind(std::string(reinterpret_cast<const char*>(&kState), sizeof(kState)));
	ASSERT_NE(place, std::string::npos);
	for (size_t number : {0, 1, 2, 4, 5}) {
		for (int32 value : {-1, 14, 0x77000000}) {
			std::string damaged = whole;
			memcpy(&damaged[place + number * sizeof(int32)], &value, sizeof(value));
			BMemoryIO all(damaged.data(), damaged.size());
			BPicture read;
			EXPECT_EQ(read.Unflatten(&all), B_BAD_DATA) << number << ": " << value;
		}
	}
}


TEST_F(PictureTest, APictureMayBeTheClipping)
{
	BPicture picture;
	fBitmaps[0]->Lock();
	fViews[0]->BeginPicture(&picture);
	fViews[0]->FillRect(BRect(2, 2, 5, 5));
	fViews[0]->EndPicture();
	fBitmaps[0]->Unlock();

	fBitmaps[1]->Lock();
	BRegion region;
	fViews[1]->ClipToPicture(&picture);
	fViews[1]->GetClippingRegion(&region);
	EXPECT_EQ(region, BRegion(BRect(2, 2, 5, 5)));
	fViews[1]->ClipToInversePicture(&picture);
	fViews[1]->GetClippingRegion(&region);
	EXPECT_FALSE(region.Contains(BPoint(3, 3)));
	EXPECT_TRUE(region.Contains(BPoint(9, 9)));
	fViews[1]->ClipToPicture(nullptr);
	fViews[1]->GetClippingRegion(&region);
	EXPECT_EQ(region, BRegion(BRect(0, 0, 19, 19)));
	fBitmaps[1]->Unlock();
}


TEST_F(PictureTest, ShapesStartAtThePen)
{
	BShape shape;
	shape.MoveTo(BPoint(0, 0));
	shape.LineTo(BPoint(6, 0));
	shape.LineTo(BPoint(6, 6));
	shape.LineTo(BPoint(0, 6));
	shape.Close();
	EXPECT_EQ(shape.Bounds(), BRect(0, 0, 6, 6));
	fBitmaps[0]->Lock();
	fViews[0]->MovePenTo(5, 5);
	fViews[0]->FillShape(&shape);
	fBitmaps[0]->Unlock();
	const auto* pixels = static_cast<const uint32*>(fBitmaps[0]->Bits());
	EXPECT_EQ(pixels[8 * 20 + 8] & 0xffffff, 0u);
	EXPECT_EQ(pixels[2 * 20 + 2] & 0xffffff, 0xffffffu);
}


TEST(ShapeTest, ShapesAreValues)
{
	BShape shape;
	EXPECT_FALSE(shape.Bounds().IsValid());
	shape.LineTo(BPoint(5, 5));
	BPoint controls[] = {{1, 1}, {2, 8}, {9, 3}};
	shape.BezierTo(controls);
	shape.Close();
	BShape copy(shape);
	EXPECT_EQ(copy, shape);
	copy.AddShape(&copy);
	EXPECT_NE(copy, shape);
	EXPECT_EQ(shape.AddShape(nullptr), B_BAD_VALUE);
	EXPECT_EQ(shape.Bounds(), BRect(0, 0, 9, 8));

	BMessage archive;
	ASSERT_EQ(shape.Archive(&archive), B_OK);
	std::unique_ptr<BArchivable> object(BShape::Instantiate(&archive));
	auto* made = dynamic_cast<BShape*>(object.get());
	ASSERT_NE(made, nullptr);
	EXPECT_EQ(*made, shape);
	copy.Clear();
	EXPECT_EQ(copy, BShape());
}
