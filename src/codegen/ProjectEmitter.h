// SPDX-License-Identifier: MIT
// The place of an emitter for what a generated program needs besides its sources.

#pragma once

/// Emits what a generated program needs besides its sources: nothing, unless a generator derives its own.
class TProjectEmitter {
public:
	virtual void EmitProject() {}
	virtual ~TProjectEmitter() = default;
};
