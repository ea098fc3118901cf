// SPDX-License-Identifier: MIT
// Lists, outline lists, scroll views and scroll bars.

#include <memory>
#include <string>
#include <vector>

#include <ListView.h>
#include <Message.h>
#include <OutlineListView.h>
#include <ScrollBar.h>
#include <ScrollView.h>
#include <StringItem.h>
#include <TextView.h>

#include "Pages.h"

namespace {

/// Lists do not own their items: this page does.
class ListsPage : public BView {
public:
	explicit ListsPage(BRect frame)
		: BView(frame, "Lists", B_FOLLOW_LEFT_TOP, B_WILL_DRAW)
	{
		SetViewColor(ui_color(B_PANEL_BACKGROUND_COLOR));
		AddPlainList();
		AddMultipleList();
		AddOutline();
		AddScrolledText();
		AddScrollBars();
	}

	~ListsPage() override
	{
		// The lists still know their items: they go first.
		while (BView* view = ChildAt(0)) {
			view->RemoveSelf();
			delete view;
		}
	}

private:
	BStringItem* MakeItem(const std::string& text, uint32 level = 0)
	{
		fItems.push_back(std::make_unique<BStringItem>(text.c_str(), level));
		return fItems.back().get();
	}

	void AddPlainList()
	{
		AddCaption(this, 10, 8, "One choice");
		BListView* list = new BListView(BRect(12, 30, 130, 130), "lvPlain");
		for (const char* planet :
			{"Mercury", "Venus", "Earth", "Mars", "Jupiter", "Saturn", "Uranus", "Neptune"})
			list->AddItem(MakeItem(planet));
		list->ItemAt(3)->SetEnabled(false);
		list->Select(2);
		list->SetSelectionMessage(new BMessage('pick'));
		AddChild(new BScrollView("svPlain", list, B_FOLLOW_LEFT_TOP, 0, false, true));
	}

	void AddMultipleList()
	{
		AddCaption(this, 170, 8, "Several choices");
		BListView* list =
			new BListView(BRect(172, 30, 290, 130), "lvMultiple", B_MULTIPLE_SELECTION_LIST);
		for (int i = 1; i <= 30; i++)
			list->AddItem(MakeItem("A line whose number is " + std::to_string(i)));
		list->Select(1, 2);
		list->Select(4, true);
		AddChild(
			new BScrollView("svMultiple", list, B_FOLLOW_LEFT_TOP, 0, true, true, B_PLAIN_BORDER));
	}

	void AddOutline()
	{
		AddCaption(this, 340, 8, "An outline");
		BOutlineListView* list = new BOutlineListView(BRect(342, 30, 490, 130), "lvOutline");
		const struct {
			const char* text;
			uint32 level;
		} kRows[] = {{"Animals", 0}, {"Birds", 1}, {"Owl", 2}, {"Swift", 2}, {"Fish", 1},
			{"Carp", 2}, {"Plants", 0}, {"Trees", 1}, {"Oak", 2}};
		for (const auto& row : kRows)
			list->AddItem(MakeItem(row.text, row.level));
		list->Collapse(list->FullListItemAt(4));
		list->Select(2);
		AddChild(new BScrollView("svOutline", list, B_FOLLOW_LEFT_TOP, 0, false, true));
	}

	void AddScrolledText()
	{
		AddCaption(this, 10, 162, "A text in a scroll view");
		const BRect frame(12, 184, 276, 270);
		BTextView* text =
			new BTextView(frame, "tvScrolled", frame.OffsetToCopy(B_ORIGIN).InsetByCopy(3, 3),
				B_FOLLOW_LEFT_TOP, B_WILL_DRAW | B_NAVIGABLE);
		std::string lines;
		for (int i = 1; i <= 20; i++)
			lines += "Line " + std::to_string(i) + " of a text that is longer than its view.\n";
		text->SetText(lines.c_str());
		AddChild(new BScrollView("svText", text, B_FOLLOW_LEFT_TOP, 0, false, true));
	}

	void AddScrollBars()
	{
		AddCaption(this, 340, 162, "Scroll bars");
		const struct {
			const char* name;
			BRect frame;
			orientation posture;
			float maximum;
			float proportion;
		} kBars[] = {{"sbHalf", BRect(342, 186, 490, 200), B_HORIZONTAL, 100, 0.5f},
			{"sbSmall", BRect(342, 210, 490, 224), B_HORIZONTAL, 1000, 0.05f},
			{"sbDisabled", BRect(342, 234, 490, 248), B_HORIZONTAL, 0, 1},
			{"sbUpright", BRect(506, 184, 520, 270), B_VERTICAL, 100, 0.3f}};
		for (const auto& row : kBars) {
			BScrollBar* bar =
				new BScrollBar(row.frame, row.name, nullptr, 0, row.maximum, row.posture);
			bar->SetProportion(row.proportion);
			bar->SetValue(row.maximum / 3);
			AddChild(bar);
		}
	}

	std::vector<std::unique_ptr<BStringItem>> fItems;
};

} // namespace


BView*
MakeListsPage(BRect frame)
{
	return new ListsPage(frame);
}
