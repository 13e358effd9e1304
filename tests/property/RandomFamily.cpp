// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Random families for the property tests. A family is grown from a list of random numbers: two founders
// first, then each further person gets parents among those before it. Contradictions are strewn over it
// afterwards.

#include "RandomFamily.h"

#include <support/FamilyMaker.h>

#include <cstdint>
#include <utility>

namespace property {

namespace {

using support::CaseFile;
using support::FamilyMaker;

template <class Make>
rc::Gen<CaseFile> madeFrom(int mostPersons, Make make) {
    return rc::gen::map(
        rc::gen::pair(rc::gen::arbitrary<std::uint64_t>(), rc::gen::inRange<int>(1, mostPersons + 1)),
        [make](const std::pair<std::uint64_t, int>& drawn) {
            FamilyMaker maker(drawn.first, drawn.second);
            return make(maker);
        });
}

}  // namespace

rc::Gen<CaseFile> consistentFamily(int mostPersons) {
    return madeFrom(mostPersons, [](FamilyMaker& maker) { return maker.consistent(); });
}

rc::Gen<CaseFile> contradictoryFamily(int mostPersons) {
    return madeFrom(mostPersons, [](FamilyMaker& maker) { return maker.contradictory(0.35); });
}

rc::Gen<CaseFile> anyFamily(int mostPersons) {
    return rc::gen::oneOf(consistentFamily(mostPersons), contradictoryFamily(mostPersons),
                          madeFrom(mostPersons, [](FamilyMaker& maker) { return maker.both(); }));
}

rc::Gen<CaseFile> anyRequest(int mostPersons) {
    const auto plainIds = rc::gen::mapcat(anyFamily(mostPersons), [](const CaseFile& family) {
        return rc::gen::map(rc::gen::arbitrary<std::uint64_t>(), [family](std::uint64_t seed) {
            CaseFile request = family;
            FamilyMaker(seed, 1).setRequest(request);
            return request;
        });
    });
    const auto oddIds = madeFrom(mostPersons, [](FamilyMaker& maker) {
        maker.strewOddIds();
        CaseFile request = maker.both();
        maker.setRequest(request);
        return request;
    });
    return rc::gen::oneOf(plainIds, oddIds);
}

}  // namespace property
