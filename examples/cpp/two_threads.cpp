// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Lays two persons out on two threads at once, each from a data source of its own.

#include <olvane/boundary/FamilyViewLayout.h>

#include <future>
#include <iostream>
#include <memory>
#include <string>

// Nobody has any relatives.
class Loners : public OlvaneViewerManagerWrapProtocol {
public:
    std::int64_t fatherForPersonWithID(std::int64_t) override { return kPersonNotFound; }
    std::int64_t motherForPersonWithID(std::int64_t) override { return kPersonNotFound; }
    std::vector<std::int64_t> spousesForPersonWithID(std::int64_t) override { return {}; }
    std::vector<std::int64_t> childrenForPersonWithID(std::int64_t) override { return {}; }
    bool isPreferredSpouse(std::int64_t, std::int64_t) override { return false; }
    bool isPersonDead(std::int64_t) override { return false; }
    std::string dateForPersonWithID(std::int64_t, bool) override { return ""; }
    std::int32_t sexOfPersonWithID(std::int64_t) override { return 0; }
};

int main() {
    const auto layOut = [](const char* person) {
        return FamilyViewLayout(person, std::make_shared<Loners>());
    };
    std::future<std::string> first = std::async(std::launch::async, layOut, "17");
    std::future<std::string> second = std::async(std::launch::async, layOut, "42");
    std::cout << first.get() << "\n" << second.get() << "\n";
}
