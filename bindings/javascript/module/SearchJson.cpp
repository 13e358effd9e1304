// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include "SearchJson.h"

#include <utility>

#include "JsonText.h"

namespace olvane::js {

std::string searchJson(const kin::PersonIndex& index, const kin::SearchTexts& texts, std::string_view text,
                       std::size_t limit) {
    JsonText json;
    json.begin();
    for (const kin::SearchHit& hit : index.find(text, limit)) {
        json.begin();
        json.number(hit.id);
        json.string(kin::nameOf(hit.fit));
        json.begin();
        for (const kin::SearchReason& reason : hit.reasons) {
            const kin::WrittenReason written = kin::writtenReason(texts, hit, reason);
            json.begin();
            json.string(kin::nameOf(reason.in));
            json.string(kin::nameOf(reason.fit));
            json.string(reason.word);
            json.string(written.text);
            json.string(written.word);
            json.string(written.label);
            json.number(written.isDate ? 1 : 0);
            json.end();
        }
        json.end();
        json.end();
    }
    json.end();
    return std::move(json).take();
}

}  // namespace olvane::js
