// SPDX-License-Identifier: MIT
// All of the Kernel Kit.

#ifndef _KERNEL_KIT_H
#define _KERNEL_KIT_H

#include <OS.h>
#include <fs_attr.h>
#include <fs_info.h>
#include <image.h>

#endif // _KERNEL_KIT_H
