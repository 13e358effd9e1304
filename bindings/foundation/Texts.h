// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#import <Foundation/Foundation.h>

#include <string>

// The text as UTF-8; empty for nil and for what has no such form.
inline std::string olvaneUtf8Of(NSString* text) {
    const char* bytes = [text UTF8String];
    return bytes ? bytes : "";
}

// The bytes as a text: of UTF-8, or else a character for each byte.
inline NSString* olvaneTextOf(const std::string& bytes) {
    NSString* text = [NSString stringWithUTF8String:bytes.c_str()];
    return text ? text : [NSString stringWithCString:bytes.c_str() encoding:NSISOLatin1StringEncoding];
}
