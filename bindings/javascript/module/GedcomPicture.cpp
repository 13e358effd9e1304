// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Pictures of an open GEDCOM file, as runs of numbers.

#include <cstddef>
#include <exception>
#include <memory>
#include <stdexcept>
#include <vector>

#include <olvane/charts/Views.h>
#include <olvane/source/LimitedDataSource.h>

#include "OpenFile.h"
#include "PictureAnswer.h"
#include "PictureRequest.h"

#define OLVANE_EXPORT(name) extern "C" __attribute__((export_name(name)))

using namespace olvane;
using js::OpenFile;

// With the words of a kinship in last_text. Null for a picture that is refused; last_text then says why.
OLVANE_EXPORT("gedcom_picture") std::vector<double>* gedcomPicture(OpenFile* file, std::int32_t focus) {
    try {
        const picture::Picture picture = js::pictureOf(*file, js::requestOf(focus - 1));
        auto numbers = std::make_unique<std::vector<double>>(js::numbersOf(picture));
        js::lastText = js::textsOf(picture);
        return numbers.release();
    } catch (const std::length_error&) {
        js::lastText = "too large";
    } catch (const std::exception& error) {
        js::lastText = error.what();
    }
    return nullptr;
}

OLVANE_EXPORT("picture_numbers") const double* pictureNumbers(const std::vector<double>* answer) {
    return answer->data();
}

OLVANE_EXPORT("picture_count") std::size_t pictureCount(const std::vector<double>* answer) {
    return answer->size();
}

OLVANE_EXPORT("picture_free") void pictureFree(std::vector<double>* answer) {
    delete answer;
}
