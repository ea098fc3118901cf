// SPDX-License-Identifier: MIT
// The component that stands for the generated application.

#pragma once

#include "model/Component.h"
#include "model/ComponentOwner.h"

/// The application of a project: its class, signature, launch behaviour, the folder that its source
/// goes to, and the events of an application. Its children are the project's forms.
class TAppComponent : public TComponent, public TComponentOwner {
public:
	TAppComponent();

	void InitPropertyList() override;
	void InitEventList() override;

	/// Until a value is stored, "ClassName" is "TMyApp" and "GenerationPath" "./MyApp", although the
	/// properties start as "TMyApplication" and "/boot/home/MyApp".
	const char* GetPropertyValue(const char* name) override;
	void SetPropertyValue(const char* name, const char* value) override;
};
