// SPDX-License-Identifier: MIT
// Components for tests, which leave no editors behind.
#ifndef TESTS_SUPPORT_TIDY_COMPONENT_H
#define TESTS_SUPPORT_TIDY_COMPONENT_H

#include <utility>

#include "model/Component.h"
#include "model/Property.h"
#include "props/PropertyEditor.h"

/// A component of class \a Base that deletes the editors of its properties at its end. Nobody owns
/// editors, so without this the leak checker would report those of every test.
template <class Base>
class TidyComponent : public Base {
public:
	template <class... Arguments>
	explicit TidyComponent(Arguments&&... arguments)
		: Base(std::forward<Arguments>(arguments)...)
	{
	}

	virtual ~TidyComponent()
	{
		for (int32 i = 0; i < this->CountProperties(); i++) {
			if (this->PropertyAt(i) != nullptr)
				delete this->PropertyAt(i)->Editor();
		}
	}
};

#endif // TESTS_SUPPORT_TIDY_COMPONENT_H
