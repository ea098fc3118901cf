// SPDX-License-Identifier: MIT

#include "props/ForgottenEditors.h"

#include <algorithm>
#include <atomic>
#include <mutex>

#include "model/BlockPool.h"
#include "model/Component.h"
#include "model/Property.h"
#include "props/PropertyEditor.h"

namespace {

// Protects the lists of all objects, and which there are.
std::mutex sMutex;
std::vector<std::vector<TPropertyEditor*>*> sLists;

// Editors are destroyed while nobody notes any, mostly.
std::atomic<int> sCount = 0;

} // namespace

TForgottenEditors::TForgottenEditors()
{
	std::lock_guard<std::mutex> lock(sMutex);
	sLists.push_back(&fEditors);
	sCount++;
}


TForgottenEditors::~TForgottenEditors()
{
	std::vector<TPropertyEditor*> editors;
	{
		std::lock_guard<std::mutex> lock(sMutex);
		sLists.erase(std::find(sLists.begin(), sLists.end(), &fEditors));
		sCount--;
		editors.swap(fEditors);
	}
	for (TPropertyEditor* editor : editors)
		delete editor;
}


void
TForgottenEditors::Add(const TComponent* component)
{
	std::lock_guard<std::mutex> lock(sMutex);
	const size_t first = fEditors.size();
	for (int32 i = 0; i < component->CountProperties(); i++) {
		TPropertyEditor* editor = component->PropertyAt(i)->Editor();
		// One that is part of something else, or of nobody knows what, is not ours to delete; two properties may share
		// one.
		if (editor != nullptr && TBlockPool::Owns(dynamic_cast<void*>(editor))
			&& std::find(fEditors.begin() + first, fEditors.end(), editor) == fEditors.end())
			fEditors.push_back(editor);
	}
}


void
TForgottenEditors::Spare()
{
	std::lock_guard<std::mutex> lock(sMutex);
	fEditors.clear();
}


void
TForgottenEditors::EditorGone(const TPropertyEditor* editor)
{
	if (sCount == 0)
		return;
	std::lock_guard<std::mutex> lock(sMutex);
	for (std::vector<TPropertyEditor*>* list : sLists)
		list->erase(std::remove(list->begin(), list->end(), editor), list->end());
}
