// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <olvane/boundary/OlvaneViewerManagerWrapProtocol.h>

// A data source of six persons: Henry (1) and Anne (2), their daughter Elizabeth (3), Henry's parents (4, 5),
// and his first wife Catherine (6).
class SmallFamily : public OlvaneViewerManagerWrapProtocol {
public:
    std::int64_t fatherForPersonWithID(std::int64_t id) override {
        return id == 1 ? 4 : id == 3 ? 1 : kPersonNotFound;
    }
    std::int64_t motherForPersonWithID(std::int64_t id) override {
        return id == 1 ? 5 : id == 3 ? 2 : kPersonNotFound;
    }
    std::vector<std::int64_t> spousesForPersonWithID(std::int64_t id) override {
        switch (id) {
            case 1:
                return {6, 2};
            case 2:
            case 6:
                return {1};
            case 4:
                return {5};
            case 5:
                return {4};
            default:
                return {};
        }
    }
    std::vector<std::int64_t> childrenForPersonWithID(std::int64_t id) override {
        switch (id) {
            case 1:
            case 2:
                return {3};
            case 4:
            case 5:
                return {1};
            default:
                return {};
        }
    }
    bool isPreferredSpouse(std::int64_t, std::int64_t spouse) override { return spouse == 6; }
    bool isPersonDead(std::int64_t) override { return true; }
    std::string dateForPersonWithID(std::int64_t id, bool isBirth) override {
        return isBirth && id == 3 ? "1533" : "";
    }
    std::int32_t sexOfPersonWithID(std::int64_t id) override { return id == 1 || id == 4 ? 0 : 1; }
};
