// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <cli/PersonFinder.h>

#include <charconv>
#include <functional>

#include <olvane/source/GedcomSearchTexts.h>

namespace olvane::cli {

namespace {

std::vector<gedcom::PersonId> idsOf(const std::vector<kin::SearchHit>& hits,
                                    const std::function<bool(const kin::SearchHit&)>& isWanted) {
    std::vector<gedcom::PersonId> ids;
    for (const kin::SearchHit& hit : hits) {
        if (isWanted(hit)) ids.push_back(static_cast<gedcom::PersonId>(hit.id));
    }
    return ids;
}

}  // namespace

gedcom::PersonId PersonFinder::byIdentifier(const std::string& text) const {
    const std::size_t first = text.find_first_not_of(' ');
    if (first == std::string::npos) return 0;
    const std::string wanted = text.substr(first, text.find_last_not_of(' ') - first + 1);
    if (const gedcom::PersonId person = data_.personByXref(wanted); person != 0) return person;
    gedcom::PersonId id = 0;
    const auto [end, error] = std::from_chars(wanted.data(), wanted.data() + wanted.size(), id);
    return error == std::errc{} && end == wanted.data() + wanted.size() && data_.hasPerson(id) ? id : 0;
}

const kin::PersonIndex& PersonFinder::index() {
    if (!index_) index_ = std::make_unique<kin::PersonIndex>(gedcom::GedcomSearchTexts(data_));
    return *index_;
}

std::vector<gedcom::PersonId> PersonFinder::find(const std::string& text, std::size_t limit) {
    if (const gedcom::PersonId person = byIdentifier(text); person != 0) return {person};
    return idsOf(index().find(text, limit), [](const kin::SearchHit&) { return true; });
}

std::vector<gedcom::PersonId> PersonFinder::meant(const std::string& text) {
    if (const gedcom::PersonId person = byIdentifier(text); person != 0) return {person};
    const std::vector<kin::SearchHit> hits = index().find(text);
    auto byName = idsOf(hits, [](const kin::SearchHit& hit) { return hit.isByName(); });
    if (!byName.empty()) return byName;
    return idsOf(hits, [](const kin::SearchHit& hit) { return hit.fit == kin::Fit::whole; });
}

}  // namespace olvane::cli
