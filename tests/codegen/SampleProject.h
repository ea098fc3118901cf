// SPDX-License-Identifier: MIT
// Forms and components for tests of the generator, made without documents and component libraries.

#pragma once

#include <memory>
#include <string>
#include <vector>

#include "model/AppComponent.h"
#include "model/ComponentOwner.h"
#include "model/ControlComponent.h"

class BApplication;
class TDesignForm;

/// The one application object of a test program; windows need it.
BApplication& TestApplication();

/// A control whose contributions to generated code can be set.
class TSampleControl : public TControlComponent {
public:
	TSampleControl(
		const char* className, const char* name, int left, int top, int right, int bottom);

	const char* HeaderFile() override { return header; }
	bool OnGenHeaderFileTop(BString& text) override;
	void OnSetConstructorParams(BString& text) override;
	bool OnGenInitForm(BString& text) override;

	/// Adds an event and selects it.
	void AddSelectedEvent(
		const char* name, const char* parameters = nullptr, const char* returnType = nullptr);

	const char* header = nullptr;
	std::string headerTop;
	std::string params;
	std::string init;
};

/// A control that other components can stand in.
class TSampleContainer : public TSampleControl, public TComponentOwner {
public:
	using TSampleControl::TSampleControl;
};

/// Sets a property's text, without telling a view.
void SetText(TComponent* component, const char* property, const char* value);

/// An application with forms, which it deletes.
class SampleProject {
public:
	SampleProject();
	~SampleProject();

	TAppComponent& App() { return fApp; }

	/// Adds a form without a window on the screen. \a path: its document, empty for none.
	TDesignForm* AddForm(const char* name, const char* path);

	/// Puts a component on a form; the form owns it.
	template <typename Component>
	Component* Place(TDesignForm* form, Component* component)
	{
		AddToForm(form, component);
		return component;
	}

	/// The application "MyApp" with the form "Form1": a button, a box with a check box in it, and a list.
	static std::unique_ptr<SampleProject> MakeFull();

private:
	void AddToForm(TDesignForm* form, TComponent* component);

	TAppComponent fApp;
	std::vector<TDesignForm*> fForms;
};
