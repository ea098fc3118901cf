// SPDX-License-Identifier: MIT
// A number that can be shown as another one while designing.

#pragma once

#include <ComponentKit.h>

/// A property with a sample: a number that stands in the design for the value, and is kept in the form's file.
///
/// The program never sees it, and a copy of the component has none.
class TSampleProperty : public TProperty {
public:
	TSampleProperty(TComponent* component, const char* name, const char* value);

	bool HasSample() const { return fHasSample; }
	/// The sample, or the value when there is none.
	int32 Shown() const;

	void SetSample(int32 sample);
	void RemoveSample();

	/// May be called again and again with the same message.
	void WriteExtendedData(BMessage* message) const override;
	/// A message without a sample leaves it as it is.
	void ReadExtendedData(const BMessage* message) override;

private:
	BString FieldName() const;

	int32 fSample;
	bool fHasSample;
};
