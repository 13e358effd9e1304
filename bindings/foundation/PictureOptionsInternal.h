// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#import <olvane/foundation/OlvanePicture.h>

#include <olvane_picture.h>

@interface OlvanePictureOptions (Internal)

// As the C interface has them, for as long as the object lives.
- (const struct olvane_picture_options*)options;

@end
