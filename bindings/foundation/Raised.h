// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#import <Foundation/Foundation.h>

#ifdef __cplusplus
extern "C" {
#endif

// Runs the call, and returns the NSException that it raised, or nil. Whatever else is thrown passes.
NSException* olvaneRaisedBy(void (*call)(void*), void* context);

#ifdef __cplusplus
}
#endif
