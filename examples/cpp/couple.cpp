// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The least that the engine can be asked: a couple, from a data source of the program's own.

#include <olvane/boundary/TypedLayout.h>

#include <iostream>
#include <memory>

// 1 is the husband of 2.
class Couple : public OlvaneViewerManagerWrapProtocol {
public:
    std::int64_t fatherForPersonWithID(std::int64_t) override { return kPersonNotFound; }
    std::int64_t motherForPersonWithID(std::int64_t) override { return kPersonNotFound; }
    std::vector<std::int64_t> spousesForPersonWithID(std::int64_t id) override { return {3 - id}; }
    std::vector<std::int64_t> childrenForPersonWithID(std::int64_t) override { return {}; }
    bool isPreferredSpouse(std::int64_t, std::int64_t) override { return true; }
    bool isPersonDead(std::int64_t) override { return false; }
    std::string dateForPersonWithID(std::int64_t, bool) override { return ""; }
    std::int32_t sexOfPersonWithID(std::int64_t id) override { return id == 1 ? 0 : 1; }
};

int main() {
    const olvane::TypedLayout layout = olvane::familyLayout(1, std::make_shared<Couple>());
    for (const auto& box : layout.boxes) std::cout << box.id << " at " << box.x << "," << box.y << "\n";
}
