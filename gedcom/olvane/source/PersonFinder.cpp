// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/source/PersonFinder.h>

#include <charconv>
#include <functional>

#include <olvane/source/GedcomSearchTexts.h>

namespace olvane::gedcom {

namespace {

std::vector<PersonId> idsOf(const std::vector<kin::SearchHit>& hits,
                            const std::function<bool(const kin::SearchHit&)>& isWanted) {
    std::vector<PersonId> ids;
    for (const kin::SearchHit& hit : hits) {
        if (isWanted(hit)) ids.push_back(static_cast<PersonId>(hit.id));
    }
    return ids;
}

}  // namespace

PersonId PersonFinder::byIdentifier(const std::string& text) const {
    const std::size_t first = text.find_first_not_of(' ');
    if (first == std::string::npos) return 0;
    const std::string wanted = text.substr(first, text.find_last_not_of(' ') - first + 1);
    if (const PersonId person = data_.personByXref(wanted); person != 0) return person;
    PersonId id = 0;
    const auto [end, error] = std::from_chars(wanted.data(), wanted.data() + wanted.size(), id);
    return error == std::errc{} && end == wanted.data() + wanted.size() && data_.hasPerson(id) ? id : 0;
}

const kin::PersonIndex& PersonFinder::index() {
    if (!index_) index_ = std::make_unique<kin::PersonIndex>(GedcomSearchTexts(data_));
    return *index_;
}

std::vector<PersonId> PersonFinder::find(const std::string& text, std::size_t limit) {
    if (const PersonId person = byIdentifier(text); person != 0) return {person};
    return idsOf(index().find(text, limit), [](const kin::SearchHit&) { return true; });
}

std::vector<PersonId> PersonFinder::meant(const std::string& text) {
    if (const PersonId person = byIdentifier(text); person != 0) return {person};
    const std::vector<kin::SearchHit> hits = index().find(text);
    auto byName = idsOf(hits, [](const kin::SearchHit& hit) { return hit.isByName(); });
    if (!byName.empty()) return byName;
    return idsOf(hits, [](const kin::SearchHit& hit) { return hit.fit == kin::Fit::whole; });
}

}  // namespace olvane::gedcom
