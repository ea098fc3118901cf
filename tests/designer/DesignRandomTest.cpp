// SPDX-License-Identifier: MIT
// A user who does anything, in any order, on two forms: nothing gets lost or out of step.

#include "designer/SurfaceTest.h"

#include <malloc.h>

#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <iostream>
#include <iterator>
#include <random>
#include <set>

#include "app/MainWindow.h"
#include "app/WindowGuard.h"
#include "codegen/CodeGenerator.h"
#include "codegen/HandlerNames.h"
#include "model/AppComponent.h"
#include "model/Diagnostics.h"
#include "model/Property.h"
#include "model/PropertyStore.h"
#include "project/Project.h"
#include "project/ProjectOperation.h"
#include "props/StringList.h"
#include "support/Printers.h"

namespace {

constexpr const char* kClasses[] = {
	"TButton", "TCheckBox", "TTextControl", "TStringView", "TBox", "TBox"};
constexpr const char* kEdges[] = {"Left", "Top", "Right", "Bottom"};

/// The usual test run has time for few; PLIM_RANDOM_ACTIONS says how many, PLIM_RANDOM_SEED which.
constexpr int kUsualActions = 40;
constexpr int kActionsBetweenReports = 250;

/// A form that has so many gets no more, so that the last action has no more to do than one long before.
constexpr int32 kMostComponents = 25;

/// What users may type as a label, a name excepted.
constexpr const char* kTexts[] = {
	"", "Label", "a \"quoted\" \\ text", "%s %d $VALUE", "\xc3\x84\xe2\x82\xac", "0"};

/// The command that no menu has.
constexpr uint32 kDuplicate = 7;


int
Setting(const char* name, int usual)
{
	const char* value = getenv(name);
	return value != nullptr ? atoi(value) : usual;
}


std::string
Content(const std::string& path)
{
	std::ifstream file(path, std::ios::binary);
	return std::string(std::istreambuf_iterator<char>(file), {});
}

} // namespace

class DesignRandomTest : public SurfaceTest {
protected:
	DesignRandomTest()
		: fSeed(Setting("PLIM_RANDOM_SEED", 1)),
		  fRandom(fSeed),
		  fForms{Form(), NewForm()}
	{
	}

	/// Thousands of forms saved and loaded would tell gigabytes.
	static void SetUpTestSuite() { ShowDiagnostics(false); }
	static void TearDownTestSuite() { ShowDiagnostics(true); }

	int Number(int below) { return std::uniform_int_distribution<int>(0, below - 1)(fRandom); }

	/// Now and then a little outside the form.
	BPoint Place() { return BPoint(Number(320) - 10, Number(310) - 5); }

	/// The middle, or the corner, of a component; none when there is none.
	bool SomeComponent(bool handle, BPoint* where)
	{
		TComponent* component = nullptr;
		Locked([&] {
			if (Form()->CountComponents() > 0)
				component = Form()->ComponentAt(Number(Form()->CountComponents()));
		});
		if (component == nullptr)
			return false;
		const BRect frame = FrameOnForm(component);
		*where = handle ? frame.RightBottom() - BPoint(Number(6), Number(6))
						: BPoint(static_cast<int>(frame.left + frame.right) / 2,
							static_cast<int>(frame.top + frame.bottom) / 2);
		// Beside the form there are other windows.
		return BRect(0, 0, 300, 300).Contains(*where);
	}

	void Drag(BPoint from, BPoint to)
	{
		fRobot.MoveTo(from);
		fRobot.Press();
		fRobot.MoveTo(from + BPoint(4, 3));
		fRobot.MoveTo(to);
		if (Number(12) == 0)
			fRobot.Key("escape");
		fRobot.Release();
	}

	std::string Act()
	{
		BPoint where;
		const int kind = Number(100);
		const bool isForMore = kind < 20 || (kind >= 87 && kind < 92);
		if (isForMore && IsFull(Form())) {
			// What lies beside the form, or below others, is out of reach.
			if (!SomeComponent(false, &where) || !ChooseFromMenu(where, "Delete"))
				return "full";
			return "make room";
		}
		if (kind < 20) {
			const char* className = kClasses[Number(std::size(kClasses))];
			Choose(className);
			Drag(BPoint(Number(290) + 5, Number(290) + 5), Place());
			return std::string("place ") + className;
		}
		if (kind < 50) {
			if (SomeComponent(false, &where))
				Drag(where, Place());
			return "drag";
		}
		if (kind < 65) {
			if (SomeComponent(true, &where))
				Drag(where, Place());
			return "resize";
		}
		if (kind < 72) {
			fRobot.Click(BPoint(Number(300), Number(300)), 1 + Number(2));
			return "click";
		}
		if (kind < 76) {
			WorkOn(OtherForm());
			return "other form";
		}
		if (kind < 82) {
			if (IsFull(OtherForm()))
				return "full on the other side";
			if (SomeComponent(false, &where)) {
				const BPoint distance(0, fForms[0] == Form() ? 320 : -320);
				Drag(where, BPoint(Number(280) + 10, Number(280) + 10) + distance);
			}
			return "drag to the other form";
		}
		if (kind < 87) {
			const char* commands[] = {"Copy", "Cut", "Delete"};
			const char* command = commands[Number(3)];
			if (SomeComponent(false, &where) && !ChooseFromMenu(where, command))
				return std::string("no menu for ") + command;
			return command;
		}
		if (kind < 91) {
			fRobot.MoveTo(BPoint(Number(300), Number(300)));
			NotePasted([this] { fRobot.Key("command+v"); });
			return "paste";
		}
		if (kind < 92) {
			if (SomeComponent(false, &where)) {
				fRobot.Click(where);
				NotePasted([this] {
					Locked([this] {
						BMessage duplicate(kDuplicate);
						Form()->HandleComponentContextMessage(&duplicate);
					});
				});
			}
			return "duplicate";
		}
		if (kind < 96) {
			if (!SomeComponent(false, &where))
				return "edit";
			fRobot.Click(where);
			return Edit(Shown());
		}
		if (kind < 97) {
			if (SomeComponent(false, &where)) {
				fRobot.Click(where);
				SetValue(Shown(), "Name", "Renamed" + std::to_string(++fNames));
			}
			return "rename";
		}
		if (kind < 98) {
			fRobot.Key("command+s");
			fRobot.Settle();
			EXPECT_FALSE(IsModified() && HasFile());
			return "save";
		}
		if (kind < 99) {
			Generate();
			return "generate";
		}
		Answer(Number(4) > 0 ? 1 : 0);
		if (!ChooseFromMenu(BPoint(298, 298), "Delete all components"))
			fRobot.Key("escape");
		Answer(0);
		return "delete all";
	}

	TDesignForm* OtherForm() const { return Form() == fForms[0] ? fForms[1] : fForms[0]; }

	static bool IsFull(TDesignForm* form)
	{
		WindowGuard guard(form);
		return form->CountComponents() >= kMostComponents;
	}

	/// Runs \a paste; what is new on the form then tells the frame that was copied.
	void NotePasted(const std::function<void()>& paste)
	{
		const std::set<TComponent*> before = Components();
		paste();
		fRobot.Settle();
		for (TComponent* component : Components()) {
			if (before.count(component) == 0)
				fPasted.insert(component);
		}
	}

	/// As the property window does it.
	void SetValue(TComponent* component, const char* name, const std::string& value)
	{
		Locked([&] {
			if (!Form()->View()->Lists(component))
				return;
			component->FindProperty(name)->Editor()->SetValue(value.c_str(), true);
			fEdited.insert(component);
		});
		fRobot.Settle();
	}

	/// Gives a property of \a component that value which its editor would let the user choose or type.
	std::string Edit(TComponent* component)
	{
		std::string name;
		std::string value;
		Locked([&] {
			if (!Form()->View()->Lists(component))
				return;
			TProperty* property = component->PropertyAt(Number(component->CountProperties()));
			name = property->Name();
			TStringList choices;
			if (property->Editor()->Type() == PET_PICKLIST) {
				property->Editor()->GetValuePickList(&choices);
				value = choices.StringAt(Number(choices.CountItems()));
			} else if (property->Editor()->Type() == PET_STRING)
				value = property->IsQuoted() ? kTexts[Number(std::size(kTexts))]
											 : std::to_string(Number(250) + 20);
		});
		if (!value.empty() && name != "Name")
			SetValue(component, name.c_str(), value);
		return "edit " + name + " to " + value;
	}

	bool HasFile() const
	{
		bool hasFile = false;
		Locked([&] { hasFile = *Form()->Filename() != '\0'; });
		return hasFile;
	}

	/// Generates all sources, which have each component of the forms.
	void Generate()
	{
		TProject* project = MainWindow()->ProjectWindow()->Project();
		const std::string folder = fFolder / "sources";
		{
			TProjectOperation operation(project);
			ASSERT_TRUE(operation.IsBegun());
			project->App()->SetPropertyValue("GenerationPath", folder.c_str());
			TCodeGenerator generator;
			generator.SetAppComponent(project->App());
			generator.GenerateApp();
		}
		for (TDesignForm* form : fForms) {
			WindowGuard guard(form);
			char base[256];
			const std::string source =
				Content(folder + "/" + BaseFormFilename(form, base) + ".fcp");
			for (int32 i = 0; i < form->CountComponents(); i++) {
				const std::string name = form->ComponentAt(i)->ComponentName();
				EXPECT_NE(source.find("  // create " + name + "\n"), std::string::npos) << name;
			}
		}
	}

	/// Forgets the components that are on neither form any more.
	void ForgetDeleted()
	{
		std::set<TComponent*> components;
		for (TDesignForm* form : fForms) {
			WindowGuard guard(form);
			for (int32 i = 0; i < form->CountComponents(); i++)
				components.insert(form->ComponentAt(i));
		}
		for (std::set<TComponent*>* noted : {&fPasted, &fEdited}) {
			for (auto i = noted->begin(); i != noted->end();)
				i = components.count(*i) > 0 ? std::next(i) : noted->erase(i);
		}
	}

	std::set<TComponent*> Components() const
	{
		std::set<TComponent*> components;
		Locked([&] {
			for (int32 i = 0; i < Form()->CountComponents(); i++)
				components.insert(Form()->ComponentAt(i));
		});
		return components;
	}

	void CheckForm(TDesignForm* form, const std::string& what)
	{
		WindowGuard guard(form);
		std::set<std::string> names;
		int32 onForm = 0;
		int32 selected = form->IsDesignerSelected() ? 1 : 0;
		for (int32 i = 0; i < form->CountComponents(); i++) {
			TComponent* component = form->ComponentAt(i);
			const std::string name = component->ComponentName();
			SCOPED_TRACE(what + ": " + name);
			EXPECT_TRUE(names.insert(name).second);
			EXPECT_EQ(name, component->FindProperty("Name")->Value());
			EXPECT_EQ(component->Designer(), static_cast<TFormDesigner*>(form->View()));
			selected += component->IsDesignerSelected() ? 1 : 0;

			BView* view = component->DTView();
			ASSERT_NE(view, nullptr);
			ASSERT_EQ(view->Window(), form);
			int32 lists = 0;
			const TComponentOwner* holder = nullptr;
			for (int32 k = 0; k < form->CountComponents(); k++) {
				TComponent* other = form->ComponentAt(k);
				TComponentOwner* container = dynamic_cast<TComponentOwner*>(other);
				for (int32 m = 0; container != nullptr && m < container->CountComponents(); m++)
					lists += container->ComponentAt(m) == component ? 1 : 0;
				if (other->DTView() == view->Parent())
					holder = container;
			}
			if (view->Parent() == form->View()) {
				onForm++;
				EXPECT_EQ(lists, 0);
				EXPECT_TRUE(component->Owner() == nullptr || form->IsForm(component->Owner()));
			} else {
				EXPECT_NE(holder, nullptr);
				EXPECT_EQ(component->Owner(), holder);
				EXPECT_EQ(lists, 1);
			}
			CheckEdges(component);
		}
		EXPECT_EQ(form->View()->CountChildren(), onForm) << what;
		EXPECT_LE(selected, 1) << what;
	}

	void CheckEdges(TComponent* component)
	{
		const BRect frame = component->DTView()->Frame();
		const int32 edges[] = {static_cast<int32>(frame.left), static_cast<int32>(frame.top),
			static_cast<int32>(frame.right), static_cast<int32>(frame.bottom)};
		bool isTold = true;
		for (int i = 0; i < 4; i++) {
			const std::string value = component->FindProperty(kEdges[i])->Value();
			EXPECT_STREQ(component->GetPropertyValue(kEdges[i]), value.c_str());
			isTold = isTold && value == std::to_string(edges[i]);
		}
		// A pasted component tells the frame that was copied, and an edited one what was typed, until it is moved.
		if (!isTold)
			EXPECT_TRUE(fPasted.count(component) + fEdited.count(component) > 0) << frame.left;
		else {
			fPasted.erase(component);
			fEdited.erase(component);
		}
	}

	void CheckInspector(const std::string& what)
	{
		TComponent* shown = Shown();
		bool isThere = shown == nullptr;
		for (TDesignForm* form : fForms) {
			WindowGuard guard(form);
			isThere = isThere || shown == form || form->View()->Lists(shown);
		}
		EXPECT_TRUE(isThere) << what;
	}

	std::string SaveAgain(const std::string& from, const char* name)
	{
		const std::string path = fFolder / name;
		TDesignForm* form = new TDesignForm("Again", FORM_HIDDEN);
		EXPECT_TRUE(form->LoadFromFile(from.c_str()));
		EXPECT_TRUE(form->SaveToFile(path.c_str()));
		form->Lock();
		form->Quit();
		return path;
	}

	void CheckDocument(TDesignForm* form, const std::string& what)
	{
		// A longer file would keep its tail.
		for (const char* name : {"first.frm", "second.frm", "third.frm"})
			std::filesystem::remove(fFolder / name);
		const std::string first = fFolder / "first.frm";
		bool isTold = true;
		{
			WindowGuard guard(form);
			EXPECT_TRUE(form->SaveToFile(first.c_str()));
			EXPECT_FALSE(form->Modified());
			for (int32 i = 0; i < form->CountComponents(); i++)
				isTold = isTold
					&& fPasted.count(form->ComponentAt(i)) + fEdited.count(form->ComponentAt(i))
						== 0;
		}
		const std::string second = SaveAgain(first, "second.frm");
		EXPECT_TRUE(!isTold || Content(first) == Content(second)) << what;
		EXPECT_TRUE(Content(second) == Content(SaveAgain(second, "third.frm"))) << what;
		// Saving by command must find a file that is the form's own.
		WindowGuard guard(form);
		form->SetFilename((fFolder / (std::string(form->ComponentName()) + ".frm")).c_str());
	}

	/// Says how far the user is, what the heap holds for the program, and how much there is on the forms.
	void Report(int actions)
	{
		int32 components = 0;
		for (TDesignForm* form : fForms) {
			WindowGuard guard(form);
			components += form->CountComponents();
		}
		const struct mallinfo2 heap = mallinfo2();
		std::cerr << actions << " actions, " << (heap.uordblks + heap.hblkhd) / 1024
				  << " kB of the heap in use, " << components << " components" << std::endl;
	}

	const int fSeed;
	std::mt19937 fRandom;
	TDesignForm* fForms[2];
	std::set<TComponent*> fPasted;
	std::set<TComponent*> fEdited;
	int fNames = 0;
};


TEST_F(DesignRandomTest, AnythingInAnyOrderKeepsAllInStep)
{
	const int actions = Setting("PLIM_RANDOM_ACTIONS", kUsualActions);
	for (int i = 0; i < actions && !HasFailure(); i++) {
		const std::string what =
			"seed " + std::to_string(fSeed) + ", action " + std::to_string(i) + " (" + Act() + ")";
		EXPECT_TRUE(fRobot.Settle()) << what;
		ForgetDeleted();
		for (TDesignForm* form : fForms)
			CheckForm(form, what);
		CheckInspector(what);
		for (TDesignForm* form : fForms)
			CheckDocument(form, what);
		if (i % kActionsBetweenReports == kActionsBetweenReports - 1)
			Report(i + 1);
	}
}
