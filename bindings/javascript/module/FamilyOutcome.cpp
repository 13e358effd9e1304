// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include "FamilyOutcome.h"

#include <utility>

#include "JsonText.h"

namespace olvane::js {

std::string lastFamilyText;

void writeRefusal(const FamilyError& error) {
    JsonText json;
    json.begin();
    json.string(error.what());
    json.string(familyTableName(error.table()));
    json.number(error.row() == FamilyError::kNoRow ? -1 : static_cast<long long>(error.row()));
    json.number(error.id());
    json.string(error.field());
    json.end();
    lastFamilyText = std::move(json).take();
}

}  // namespace olvane::js
