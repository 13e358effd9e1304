// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Knows of nothing but pictures.

#include <iostream>

#include <olvane/picture/PictureJson.h>

int main() {
    olvane::picture::Picture picture;
    picture.boxes.push_back({.id = 17});
    std::cout << olvane::picture::pictureJson(picture);
}
