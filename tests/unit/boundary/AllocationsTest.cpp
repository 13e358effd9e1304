// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Memory that runs out at each allocation of a request in turn. Inside the guarded region the text written so
// far comes back; before and behind it std::bad_alloc reaches the caller. Nothing is ever left behind.

#include <cstdint>
#include <functional>
#include <memory>
#include <new>
#include <string>

#include <gtest/gtest.h>

#include <olvane/boundary/FamilyViewLayout.h>
#include <support/FamilyText.h>
#include <unit/boundary/AllocationCountdown.h>
#include <unit/boundary/DisturbedRequests.h>
#include <unit/boundary/Request.h>

namespace {

using support::CaseFile;
using support::family;
using unit::AllocationFailure;
using unit::allocationsMade;
using unit::allocationsOutstanding;

typedef std::shared_ptr<OlvaneViewerManagerWrapProtocol> Source;
typedef std::function<std::string()> Layout;

struct Attempt {
    std::string text;
    bool passedOn = false;  // std::bad_alloc came out
    std::int64_t allocations = 0;
    std::int64_t leftBehind = 0;  // beside the text
};

Attempt layOutWithFailureAt(std::int64_t n, const Layout& layOut) {
    Attempt attempt;
    const std::int64_t madeBefore = allocationsMade();
    const std::int64_t outstandingBefore = allocationsOutstanding();
    {
        std::string text;
        try {
            const AllocationFailure failure(n);
            text = layOut();
        } catch (const std::bad_alloc&) {
            attempt.passedOn = true;
        }
        attempt.allocations = allocationsMade() - madeBefore;
        attempt.text = text;
        text = std::string();
    }
    const std::int64_t keptByAttempt = attempt.text.size() > std::string().capacity() ? 1 : 0;
    attempt.leftBehind = allocationsOutstanding() - outstandingBefore - keptByAttempt;
    return attempt;
}

// Allocations ahead of the guarded region: the tables and the callbacks.
std::int64_t allocationsBeforeTheGuard(const Source& source) {
    const std::int64_t before = allocationsMade();
    ViewerGlue glue;
    const olvane::HostCallbacks callbacks(glue, source);
    return allocationsMade() - before;
}

// The first ones, as many as are stated, and the last one, which makes the returned text, lie outside the guard.
void expectEveryAllocationMayFail(const Layout& layOut, std::int64_t before) {
    const Attempt whole = layOutWithFailureAt(0, layOut);
    ASSERT_LT(100u, whole.text.size());
    ASSERT_EQ(0, whole.leftBehind);
    int cutTexts = 0;
    for (std::int64_t n = 1; n <= whole.allocations; ++n) {
        const Attempt attempt = layOutWithFailureAt(n, layOut);
        const bool isOutside = n <= before || n == whole.allocations;
        EXPECT_EQ(isOutside, attempt.passedOn) << "allocation " << n << " of " << whole.allocations;
        EXPECT_EQ(0, attempt.leftBehind) << "allocation " << n;
        EXPECT_EQ(whole.text.substr(0, attempt.text.size()), attempt.text) << "allocation " << n;
        EXPECT_LT(attempt.text.size(), whole.text.size()) << "allocation " << n;
        cutTexts += attempt.text.empty() ? 0 : 1;
        ASSERT_EQ(whole.text, layOut()) << "behind a failure of allocation " << n;
    }
    EXPECT_LT(0, cutTexts);  // some failed while records were written
}

void expectEveryAllocationMayFail(const CaseFile& input) {
    const Source source = std::make_shared<support::CaseManager>(input);
    const Layout layOut = [&source] {
        std::string text = FamilyViewLayout("17", source);
        EXPECT_EQ(1, source.use_count());
        return text;
    };
    expectEveryAllocationMayFail(layOut, allocationsBeforeTheGuard(source));
}

TEST(MemoryRunsOut, atAnyAllocationOfASmallFamilyAPrefixComesBackAndNothingLeaks) {
    expectEveryAllocationMayFail(family("17+42: 5; 3+4: 17"));
}

TEST(MemoryRunsOut, atAnyAllocationOfAFamilyWithSiblingsStepChildrenAndUnknownParents) {
    CaseFile input = family("17+42: 5 6f; 17+43; 42f: 8; 3+4: 17 18; 3: 20; 1+2: 3 22; 5+50: 51");
    input.births[17] = "1850";
    expectEveryAllocationMayFail(input);
}

TEST(MemoryRunsOut, atAnyAllocationOfGoldenCasesOfBothViewsAPrefixComesBackAndNothingLeaks) {
    for (const unit::DisturbedRequest& request : unit::disturbedRequests()) {
        SCOPED_TRACE(request.name);
        const std::int64_t atFirst = allocationsMade();
        const Source source = std::make_shared<support::CaseManager>(support::borrowed(request.input));
        const std::int64_t before = allocationsMade() - atFirst + allocationsBeforeTheGuard(source);
        expectEveryAllocationMayFail([&request] { return support::layoutText(request.input); }, before);
    }
}

TEST(MemoryRunsOut, forTheReturnedTextBehindTheLayoutTheFailurePassesOn) {
    const Source source = std::make_shared<support::CaseManager>(family("17"));
    const Layout layOut = [&source] { return FamilyViewLayout("17", source); };
    const std::int64_t all = layOutWithFailureAt(0, layOut).allocations;
    const Attempt attempt = layOutWithFailureAt(all, layOut);
    EXPECT_TRUE(attempt.passedOn);
    EXPECT_EQ(0, attempt.leftBehind);
}

TEST(MemoryRunsOut, insideTheHostItIsAFailureOfTheHostLikeAnyOther) {
    class HostOutOfMemory : public support::CaseManager {
    public:
        using CaseManager::CaseManager;
        std::int64_t motherForPersonWithID(std::int64_t) override { throw std::bad_alloc(); }
    };
    EXPECT_EQ("", FamilyViewLayout("17", std::make_shared<HostOutOfMemory>(family("17"))));
}

}  // namespace
