// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/kin/PersonIndex.h>

#include <gtest/gtest.h>

#include <new>
#include <string>

#include <unit/boundary/AllocationCountdown.h>

namespace olvane::kin {
namespace {

Family darwins() {
    Family family;
    for (std::int64_t id = 1; id <= 3; ++id) {
        PersonRow row;
        row.id = id;
        row.birth = "1809";
        family.addPerson(row);
        const std::string name = "Emma Georgiana O'Wedgwood-Darwin the " + std::to_string(id) + "th";
        family.setNames(id, std::vector<NamePart>{{NameKind::full, name}});
        family.setField(id, "xref", "a rather long identifier " + std::to_string(id));
    }
    return family;
}

std::string foundIn(const PersonIndex& index) {
    std::string found;
    for (const char* const text :
         {"emma", "wedgwood 3th", "georgianna", "1809", "a rather long identifier 2", "2"}) {
        for (const SearchHit& hit : index.find(text))
            found += std::to_string(hit.id) + hit.reasons[0].word + " ";
        found += "; ";
    }
    return found;
}

// Whichever block of memory is not to be had, the index can be searched then, and lacks nobody once it is called again.
TEST(PersonIndex, isCompletedAfterMemoryHasRunOut) {
    const Family family = darwins();
    const FamilySearchTexts texts(family);
    const std::string expected = foundIn(PersonIndex(texts));
    int failures = 0;
    for (bool hasFailed = true; hasFailed; ++failures) {
        PersonIndex index;
        hasFailed = false;
        try {
            const unit::AllocationFailure failure(failures + 1);
            index.add(texts);
        } catch (const std::bad_alloc&) {
            hasFailed = true;
        }
        EXPECT_LE(index.find("emma").size(), 3U);
        EXPECT_LE(index.find("a rather long identifier 2").size(), 3U);
        EXPECT_TRUE(index.add(texts));
        EXPECT_EQ(foundIn(index), expected) << "failure " << failures + 1;
    }
    EXPECT_GT(failures, 20);
}

}  // namespace
}  // namespace olvane::kin
