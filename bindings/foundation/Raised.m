// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Not in Objective-C++, where GCC's runtime cannot catch by class.

#import "Raised.h"

NSException* olvaneRaisedBy(void (*call)(void*), void* context) {
    @try {
        call(context);
    } @catch (NSException* exception) {
        return [[exception retain] autorelease];
    }
    return nil;
}
