// SPDX-License-Identifier: MIT
// The line between groups of menu items.
#ifndef _SEPARATOR_ITEM_H
#define _SEPARATOR_ITEM_H

#include <MenuItem.h>

/// A line between items: it has no label, is never enabled, and cannot be chosen.
class BSeparatorItem : public BMenuItem {
public:
	BSeparatorItem();
	BSeparatorItem(BMessage* archive);
	virtual ~BSeparatorItem();

	static BArchivable* Instantiate(BMessage* archive);
	status_t Archive(BMessage* archive, bool deep = true) const override;

	/// Does nothing.
	void SetEnabled(bool enable) override;

protected:
	void GetContentSize(float* _width, float* _height) override;
	void Draw() override;
};

#endif // _SEPARATOR_ITEM_H
