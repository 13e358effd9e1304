// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A database that breaks down in the middle of a layout, and what its program learns of that.

#include <olvane/boundary/CheckedLayout.h>

#include <cstdint>
#include <iostream>
#include <memory>
#include <stdexcept>
#include <string>
#include <vector>

class BrokenFamily : public OlvaneViewerManagerWrapProtocol {
public:
    std::int64_t fatherForPersonWithID(std::int64_t) override { return kPersonNotFound; }
    std::int64_t motherForPersonWithID(std::int64_t) override { return kPersonNotFound; }
    std::vector<std::int64_t> spousesForPersonWithID(std::int64_t) override { return {}; }
    std::vector<std::int64_t> childrenForPersonWithID(std::int64_t) override {
        throw std::runtime_error("the database is closed");
    }
    bool isPreferredSpouse(std::int64_t, std::int64_t) override { return false; }
    bool isPersonDead(std::int64_t) override { return false; }
    std::string dateForPersonWithID(std::int64_t, bool) override { return ""; }
    std::int32_t sexOfPersonWithID(std::int64_t) override { return 0; }
};

int main() {
    const auto source = std::make_shared<BrokenFamily>();
    const auto result = olvane::checkedLayout(olvane::TypedLayout::View::family, 17, source);
    std::cout << result.reason.text() << '\n';
    return result.status == olvane::CheckedStatus::hostFailed ? 0 : 1;
}
