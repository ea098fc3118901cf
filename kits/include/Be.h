// SPDX-License-Identifier: MIT
// All kits.

#ifndef _BE_H
#define _BE_H

#include <AppKit.h>
#include <InterfaceKit.h>
#include <KernelKit.h>
#include <StorageKit.h>
#include <SupportKit.h>
#include <TranslationKit.h>

#endif // _BE_H
