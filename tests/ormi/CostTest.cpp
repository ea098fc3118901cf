// SPDX-License-Identifier: MIT
// What events cost that nobody handles: the room of their pointers.

#include <Ormi.h>

#include <cstdlib>
#include <new>
#include <typeinfo>

#include <gtest/gtest.h>

namespace {

/// Of this thread.
thread_local int sAllocations = 0;

} // namespace

void*
operator new(size_t size)
{
	sAllocations++;
	void* memory = malloc(size);
	if (memory == nullptr)
		throw std::bad_alloc();
	return memory;
}


// Neither is inlined: compilers take a free() that they see behind a new for a mistake.
[[gnu::noinline]] void
operator delete(void* memory) noexcept
{
	free(memory);
}


[[gnu::noinline]] void
operator delete(void* memory, size_t) noexcept
{
	free(memory);
}

namespace {

/// The second time: the first may fill what is kept.
template <class Task>
int
AllocationsOf(Task task)
{
	task();
	const int before = sAllocations;
	task();
	return sAllocations - before;
}

} // namespace

class CostTest : public testing::Test {
protected:
	CostTest()
		: fForm(new TForm(
			BRect(100, 100, 399, 299), "Plain", B_TITLED_WINDOW_LOOK, B_NORMAL_WINDOW_FEEL, 0))
	{
		fForm->SetFormView(new TFormView(fForm, "view"));
		fForm->Show();
		fForm->Lock();
	}

	~CostTest() { fForm->Quit(); }

	template <class Component, class... Arguments>
	Component* Add(Arguments... arguments)
	{
		Component* component = new Component(fForm, BRect(10, 10, 99, 39), "one", arguments...);
		fForm->FormView()->AddChild(component);
		return component;
	}

	BApplication fApplication{"application/x-vnd.plimworks-ormi-test"};
	TForm* fForm;
};


TEST_F(CostTest, NoComponentAsksForPulsesOrTheMouseBeyondWhatItsViewDoes)
{
	const std::pair<BView*, BView*> kPairs[] = {
		{Add<TButton<TForm>>(""), new BButton(BRect(), "", "", nullptr)},
		{Add<TCheckBox<TForm>>(""), new BCheckBox(BRect(), "", "", nullptr)},
		{Add<TRadioButton<TForm>>(""), new BRadioButton(BRect(), "", "", nullptr)},
		{Add<TTextControl<TForm>>("", ""), new BTextControl(BRect(), "", "", "", nullptr)},
		{Add<TStringView<TForm>>(""), new BStringView(BRect(), "", "")},
		{Add<TBox<TForm>>(""), new BBox(BRect())},
		{Add<TView<TForm>>(), new BView(BRect(), "", B_FOLLOW_NONE, B_WILL_DRAW)},
		{Add<TTextView<TForm>>(), new Ormi::TextPane(BRect(), "")},
		{Add<TListView<TForm>>(), new BListView(BRect(), "")},
		{Add<TOutlineListView<TForm>>(), new BOutlineListView(BRect(), "")},
		{Add<TMenuField<TForm>>(""), new Ormi::ChoiceField(BRect(), "", "")},
		{Add<TMenuBar<TForm>>(), new Ormi::MenuRow(BRect(), "")},
		{Add<TSlider<TForm>>(""), new Ormi::RangeSlider(BRect(), "", "")},
		{Add<TStatusBar<TForm>>(), new Ormi::ProgressBar(BRect(), "")},
		{Add<TColorControl<TForm>>(), new Ormi::ColorPanel(BRect(), "")},
		{Add<TPictureView<TForm>>(), new Ormi::PicturePane(BRect(), "")},
		{Add<TPictureButton<TForm>>(), new Ormi::FileButton(BRect(), "")},
		{Add<TScrollView<TForm>>(true, true, B_PLAIN_BORDER),
			new Ormi::ScrollPane(BRect(), "", true, true, B_PLAIN_BORDER)},
		{Add<TTabView<TForm>>(), new Ormi::TabPane(BRect(), "")},
	};
	for (const auto& [component, view] : kPairs) {
		// Frames are told of so that a handler may be set at any time.
		EXPECT_EQ(component->Flags(), view->Flags() | B_FRAME_EVENTS) << typeid(*component).name();
		EXPECT_EQ(component->EventMask(), view->EventMask()) << typeid(*component).name();
		delete view;
	}
}


TEST_F(CostTest, AnEventTakesTheRoomOfItsPointer)
{
	struct parts_own {
		void* form;
		uint32 flags;
		BRect frame;
		bool hasFocus;
	};
	const size_t kPointer = sizeof(void(TForm::*)());
	const size_t kBase = 13 * kPointer + sizeof(TFormPart) + sizeof(parts_own);
	const size_t kRounding = 2 * sizeof(void*);
	EXPECT_LE(sizeof(TPart<TForm, BView>), sizeof(BView) + kBase + kRounding);
	EXPECT_LE(sizeof(TButton<TForm>), sizeof(BButton) + kBase + kPointer + kRounding);
	EXPECT_LE(sizeof(TListView<TForm>), sizeof(BListView) + kBase + 2 * kPointer + kRounding);
}


TEST_F(CostTest, HooksWithoutHandlersAllocateNothing)
{
	TView<TForm>* part = Add<TView<TForm>>();
	BView* view = new BView(BRect(10, 50, 99, 79), "view", B_FOLLOW_NONE, B_WILL_DRAW);
	fForm->FormView()->AddChild(view);
	const auto Use = [](BView* used) {
		used->MouseMoved(BPoint(1, 1), B_INSIDE_VIEW, nullptr);
		used->MouseDown(BPoint(1, 1));
		used->MouseUp(BPoint(1, 1));
		used->KeyUp("x", 1);
		used->FrameMoved(BPoint(1, 1));
		used->FrameResized(10, 10);
		used->AttachedToWindow();
		used->AllAttached();
		used->AllDetached();
	};
	EXPECT_EQ(AllocationsOf([&] { Use(part); }), AllocationsOf([&] { Use(view); }));
}
