// SPDX-License-Identifier: MIT
// All kits.

#ifndef _BE_H
#define _BE_H

#include <AppKit.h>
#include <InterfaceKit.h>
#include <KernelKit.h>
#include <StorageKit.h>
#include <SupportKit.h>
#if __has_include(<TranslationKit.h>)
#include <TranslationKit.h>
#endif

#endif // _BE_H
