// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The C interface gives what the engine gives, reports what went wrong, and lets nothing escape.

#include <algorithm>
#include <atomic>
#include <limits>
#include <set>
#include <stdexcept>
#include <string>
#include <thread>
#include <vector>

#include <pthread.h>

#include <gtest/gtest.h>

#include <olvane_picture.h>

#include <olvane/Version.h>
#include <olvane/boundary/CheckedLayout.h>
#include <olvane/family/FamilyOptions.h>
#include <support/CaseRun.h>
#include <support/FamilyMaker.h>
#include <support/FamilyText.h>
#include <unit/bindings-c/CallbackHost.h>
#include <unit/boundary/DisturbedRequests.h>

namespace {

using support::CaseFile;
using support::CaseView;
using support::family;
using unit::Answer;
using unit::CallbackHost;
using unit::familyOf;
using unit::layoutOf;
using unit::pedigreeOf;
using unit::readerForm;

const char* const kThreeGenerations = "17+42: 5 6f; 3+4: 17 18; 1+2: 3; 5+8: 9";

CaseFile randomRequest(std::uint64_t seed) {
    support::FamilyMaker maker(seed, 30);
    CaseFile request = maker.any();
    maker.setRequest(request);
    request.adapter = support::CaseAdapter::host;
    if (request.view == CaseView::pedigree) {
        request.maxGenerations = std::max(1, request.maxGenerations);
        request.maxStackDepth = std::max(0, request.maxStackDepth);
    }
    return request;
}

TEST(CLayout, hasTheTextOfTheEngine) {
    const CaseFile input = family(kThreeGenerations);
    const Answer answer = layoutOf(input);
    EXPECT_EQ(OLVANE_OK, answer.status);
    EXPECT_NE("", answer.text());
    EXPECT_EQ(support::layoutText(input), answer.text());
}

TEST(CLayout, hasTheTextOfTheEngineForManyFamiliesAndRequests) {
    int complete = 0;
    int pedigrees = 0;
    for (std::uint64_t seed = 1; seed <= 400; ++seed) {
        const CaseFile request = randomRequest(seed);
        const Answer answer = layoutOf(request);
        ASSERT_NE(nullptr, answer.layout) << support::formatCase(request);
        ASSERT_EQ(support::layoutText(request), answer.text()) << support::formatCase(request);
        complete += answer.status == OLVANE_OK ? 1 : 0;
        pedigrees += request.view == CaseView::pedigree ? 1 : 0;
    }
    EXPECT_GT(complete, 200);
    EXPECT_GT(pedigrees, 20);
}

TEST(CLayout, asksTheSameQuestionsAsTheEngine) {
    CallbackHost host(family(kThreeGenerations), true);
    ASSERT_EQ(OLVANE_OK, familyOf(host.callbacks(), 17).status);
    std::vector<std::string> calls = support::runCase(family(kThreeGenerations), false, true);
    calls.erase(calls.begin());  // the text
    EXPECT_EQ(calls, host.source.trace());
}

TEST(CRecords, sayWhatTheTextSays) {
    std::size_t addNodes = 0;
    for (std::uint64_t seed = 1; seed <= 100; ++seed) {
        const Answer answer = layoutOf(randomRequest(seed));
        std::vector<olvane::LayoutRecord> records;
        for (const olvane_record& record : answer.records()) {
            records.push_back(readerForm(record));
            addNodes += record.kind == OLVANE_PERSON ? 0 : 1;
            EXPECT_EQ(record.segment_count == 0, record.segments == nullptr);
        }
        ASSERT_EQ(olvane::readWholeRecords(answer.text()).records, records);
    }
    EXPECT_GT(addNodes, 100u);
}

TEST(CRecords, stateForWhomAnAddNodeStands) {
    const Answer answer = layoutOf(family("17"));
    const std::vector<olvane_record> records = answer.records();
    ASSERT_EQ(3u, records.size());
    EXPECT_EQ(OLVANE_PERSON, records[0].kind);
    EXPECT_EQ(0, records[0].child);
    EXPECT_EQ(OLVANE_MISSING_FATHER, records[1].kind);
    EXPECT_EQ(-1, records[1].id);
    EXPECT_EQ(17, records[1].child);
    EXPECT_EQ(OLVANE_MISSING_MOTHER, records[2].kind);
}

TEST(COptions, standAtWhatTheEngineTakes) {
    olvane_options options;
    ASSERT_EQ(OLVANE_OK, olvane_options_default(&options));
    CallbackHost host(family(kThreeGenerations));
    EXPECT_EQ(familyOf(host.callbacks(), 17).text(), familyOf(host.callbacks(), 17, &options).text());
    EXPECT_EQ(pedigreeOf(host.callbacks(), 17).text(), pedigreeOf(host.callbacks(), 17, &options).text());
    EXPECT_EQ(55.0f, options.sizes.node_width);
    EXPECT_EQ(5, options.generations);
}

TEST(COptions, leaveOutWhomTheyName) {
    using namespace SharedTreeViewer;
    const std::vector<std::string> keys = {
        kTreeViewFamShowAuntsUnclesKey,       kTreeViewFamShowCousinsKey,
        kTreeViewFamShowSiblingsKey,          kTreeViewFamShowSiblingSpousesKey,
        kTreeViewFamShowNeicesNephewsKey,     kTreeViewFamShowGrandchildrenKey,
        kTreeViewFamShowGreatGrandparentsKey, kTreeViewFamShowSpousesOfChildrenKey};
    const CaseFile everybody =
        family("17+42: 5; 5+50: 51; 3+4: 17 18; 18+80: 81; 1+2: 3 7; 7+70: 71; 11+12: 1");
    const std::string whole = layoutOf(everybody).text();
    std::set<std::string> texts;
    for (const std::string& key : keys) {
        CaseFile request = everybody;
        request.options[key] = false;
        const std::string text = layoutOf(request).text();
        EXPECT_NE(whole, text) << key;
        EXPECT_EQ(support::layoutText(request), text) << key;
        texts.insert(text);
    }
    EXPECT_EQ(keys.size(), texts.size());
}

TEST(COptions, outOfTheirRangeAreRefused) {
    CallbackHost host(family("17"));
    const auto statusWith = [&host](auto change) {
        olvane_options options;
        olvane_options_default(&options);
        change(options);
        const Answer answer = pedigreeOf(host.callbacks(), 17, &options);
        EXPECT_EQ(answer.status == OLVANE_OK, answer.layout != nullptr);
        return answer.status;
    };
    EXPECT_EQ(OLVANE_OK, statusWith([](olvane_options&) {}));
    EXPECT_EQ(OLVANE_OK, statusWith([](olvane_options& o) { o.generations = 1; }));
    EXPECT_EQ(OLVANE_OK, statusWith([](olvane_options& o) { o.flag_depth = 0; }));
    EXPECT_EQ(OLVANE_INVALID_ARGUMENT, statusWith([](olvane_options& o) { o.generations = 0; }));
    EXPECT_EQ(OLVANE_OK, statusWith([](olvane_options& o) { o.generations = OLVANE_MOST_GENERATIONS; }));
    EXPECT_EQ(OLVANE_INVALID_ARGUMENT,
              statusWith([](olvane_options& o) { o.generations = OLVANE_MOST_GENERATIONS + 1; }));
    EXPECT_EQ(OLVANE_INVALID_ARGUMENT, statusWith([](olvane_options& o) { o.flag_depth = -1; }));
    EXPECT_EQ(OLVANE_INVALID_ARGUMENT, statusWith([](olvane_options& o) { o.shown = 0x100u; }));
    EXPECT_EQ(OLVANE_INVALID_ARGUMENT, statusWith([](olvane_options& o) {
                  o.sizes.line_inset = std::numeric_limits<float>::quiet_NaN();
              }));
    EXPECT_EQ(OLVANE_INVALID_ARGUMENT, statusWith([](olvane_options& o) {
                  o.sizes.node_width = std::numeric_limits<float>::infinity();
              }));
}

TEST(COptions, takeAnyFiniteSize) {
    CallbackHost host(family("17+42: 5"));
    olvane_options options;
    olvane_options_default(&options);
    for (const float width : {0.0f, -55.0f, 3e38f}) {
        options.sizes.node_width = width;
        const Answer answer = familyOf(host.callbacks(), 17, &options);
        EXPECT_EQ(OLVANE_OK, answer.status) << width;
        std::int32_t right = std::numeric_limits<std::int32_t>::min();
        for (const olvane_record& record : answer.records()) right = std::max(right, record.x);
        EXPECT_EQ(width == 3e38f, right == std::numeric_limits<std::int32_t>::max()) << right;
    }
}

std::string failureOf(const Answer& answer) {
    const char* text = nullptr;
    EXPECT_EQ(OLVANE_OK, olvane_layout_failure(answer.layout.get(), &text));
    return text;
}

// The engine would cut each of these to 32 bits and draw somebody else.
TEST(CAnsweredIds, thatAreNot1To2147483647EndTheLayoutByName) {
    for (const std::int64_t id : {std::int64_t{0}, std::int64_t{-1}, std::int64_t{-5}, std::int64_t{1} << 31,
                                  (std::int64_t{1} << 32) + 4, (std::int64_t{1} << 53) + 1,
                                  std::numeric_limits<std::int64_t>::min()}) {
        CaseFile input = family("17");
        input.fathers[17] = id;
        const Answer father = layoutOf(input);
        EXPECT_EQ(OLVANE_INVALID_ID, father.status) << id;
        EXPECT_EQ(
            "father_of(17) answered " + std::to_string(id) + ", which is no id: ids are 1 to 2147483647",
            failureOf(father));
        input = family("17+42");
        input.spouses[17].push_back(id);
        EXPECT_EQ(OLVANE_INVALID_ID, layoutOf(input).status) << id;
        input = family("17+42: 5");
        input.children[42].push_back(id);
        EXPECT_EQ(OLVANE_INVALID_ID, layoutOf(input).status) << id;
    }
}

TEST(CAnsweredIds, atTheEndsOfTheRangeAreDrawn) {
    const Answer answer = layoutOf(family("1+2147483647: 2"));
    EXPECT_EQ(OLVANE_OK, answer.status);
    EXPECT_NE(std::string::npos, answer.text().find(";2147483647:"));
}

TEST(CAnsweredIds, thatAreOddNeverDrawSomebodyElse) {
    int refused = 0;
    for (std::uint64_t seed = 1; seed <= 200; ++seed) {
        support::FamilyMaker maker(seed, 20);
        maker.strewOddIds();
        const CaseFile input = maker.any();
        if (input.focus < 1 || input.focus > std::numeric_limits<std::int32_t>::max()) continue;
        const Answer answer = layoutOf(input);
        if (answer.status == OLVANE_OK) {
            EXPECT_EQ(support::layoutText(input), answer.text()) << support::formatCase(input);
        } else {
            EXPECT_EQ(OLVANE_INVALID_ID, answer.status) << support::formatCase(input);
            EXPECT_EQ("", answer.text());
            ++refused;
        }
    }
    EXPECT_LT(20, refused);
}

TEST(CNobody, isTheConstant) {
    CaseFile input = family("17");
    input.fathers[17] = OLVANE_PERSON_NOT_FOUND;
    EXPECT_EQ(layoutOf(family("17")).text(), layoutOf(input).text());
}

TEST(CFailures, nameTheCallbackAndThePerson) {
    CaseFile input = family("17+42");
    input.failures[support::HostOperation::isPersonDead] = {1};
    const Answer answer = layoutOf(input);
    EXPECT_EQ(OLVANE_HOST_FAILED, answer.status);
    EXPECT_EQ("is_dead(42) returned " + std::to_string(unit::kHostCode), failureOf(answer));
    EXPECT_EQ("", failureOf(layoutOf(family("17"))));
    EXPECT_EQ(OLVANE_INVALID_ARGUMENT, olvane_layout_failure(answer.layout.get(), nullptr));
}

// Lets each call of a request fail in turn; behind each failure the request is whole again. The number of calls.
std::size_t letEveryCallFail(const CaseFile& input) {
    std::vector<std::string> calls = support::runCase(input, false, true);
    calls.erase(calls.begin());  // the text
    for (std::string& call : calls) call.erase(0, std::string("call ").size());
    const std::string whole = support::layoutText(input);
    for (std::size_t n = 0; n < calls.size(); ++n) {
        const CaseFile failing = unit::failingAt(input, calls, n);
        const Answer answer = layoutOf(failing);
        EXPECT_EQ(OLVANE_HOST_FAILED, answer.status) << calls[n];
        EXPECT_EQ(unit::kHostCode, answer.hostCode()) << calls[n];
        EXPECT_EQ(support::layoutText(failing), answer.text()) << calls[n];
        const Answer again = layoutOf(input);
        EXPECT_EQ(OLVANE_OK, again.status) << "behind " << calls[n];
        EXPECT_EQ(whole, again.text()) << "behind " << calls[n];
    }
    return calls.size();
}

TEST(CFailures, ofAnyCallbackAtAnyTimeAreReportedInBothViews) {
    CaseFile input = family(kThreeGenerations);
    EXPECT_LT(60u, letEveryCallFail(input));
    input.view = CaseView::pedigree;
    input.maxGenerations = 4;
    EXPECT_LT(20u, letEveryCallFail(input));
}

TEST(CFailures, ofAnyCallbackAtAnyTimeOfGoldenCasesAreReported) {
    for (const unit::DisturbedRequest& request : unit::disturbedRequests()) {
        SCOPED_TRACE(request.name);
        EXPECT_LT(10u, letEveryCallFail(request.input));
    }
}

TEST(CFailures, leaveNoCodeWhereTheHostIsSound) {
    EXPECT_EQ(0, layoutOf(family("17")).hostCode());
}

TEST(CFailures, ofACallbackThatThrowsCountAsItsOwn) {
    CallbackHost host(family("17"));
    olvane_host callbacks = host.callbacks();
    callbacks.sex_of = [](void*, std::int64_t, std::int32_t*) -> int { throw std::runtime_error("thrown"); };
    const Answer answer = familyOf(callbacks, 17);
    EXPECT_EQ(OLVANE_HOST_FAILED, answer.status);
    EXPECT_EQ(-1, answer.hostCode());
    EXPECT_EQ("", answer.text());
}

TEST(CFailures, ofMissingCallbacksAreSeenBeforeTheFirstQuestion) {
    CallbackHost host(family("17"));
    const auto statusWithout = [&host](auto member) {
        olvane_host callbacks = host.callbacks();
        callbacks.*member = nullptr;
        return familyOf(callbacks, 17).status;
    };
    EXPECT_EQ(OLVANE_INVALID_ARGUMENT, statusWithout(&olvane_host::father_of));
    EXPECT_EQ(OLVANE_INVALID_ARGUMENT, statusWithout(&olvane_host::mother_of));
    EXPECT_EQ(OLVANE_INVALID_ARGUMENT, statusWithout(&olvane_host::spouses_of));
    EXPECT_EQ(OLVANE_INVALID_ARGUMENT, statusWithout(&olvane_host::children_of));
    EXPECT_EQ(OLVANE_INVALID_ARGUMENT, statusWithout(&olvane_host::is_preferred_spouse));
    EXPECT_EQ(OLVANE_INVALID_ARGUMENT, statusWithout(&olvane_host::is_dead));
    EXPECT_EQ(OLVANE_INVALID_ARGUMENT, statusWithout(&olvane_host::date_of));
    EXPECT_EQ(OLVANE_INVALID_ARGUMENT, statusWithout(&olvane_host::sex_of));
    EXPECT_EQ(0, host.source.callCount());
}

TEST(CFailures, ofNullPointersAreStatuses) {
    CallbackHost host(family("17"));
    const olvane_host callbacks = host.callbacks();
    olvane_layout* layout = reinterpret_cast<olvane_layout*>(&host);
    EXPECT_EQ(OLVANE_INVALID_ARGUMENT, olvane_layout_family(nullptr, 17, nullptr, &layout));
    EXPECT_EQ(nullptr, layout);
    EXPECT_EQ(OLVANE_INVALID_ARGUMENT, olvane_layout_pedigree(&callbacks, 17, nullptr, nullptr));
    const char* text = nullptr;
    const olvane_record* records = nullptr;
    std::size_t count = 0;
    int code = 0;
    EXPECT_EQ(OLVANE_INVALID_ARGUMENT, olvane_layout_text(nullptr, &text, nullptr));
    EXPECT_EQ(OLVANE_INVALID_ARGUMENT, olvane_layout_records(nullptr, &records, &count));
    EXPECT_EQ(OLVANE_INVALID_ARGUMENT, olvane_layout_host_code(nullptr, &code));
    EXPECT_EQ(OLVANE_INVALID_ARGUMENT, olvane_options_default(nullptr));
    EXPECT_EQ(OLVANE_INVALID_ARGUMENT, olvane_person_list_append(nullptr, nullptr, 0));
    EXPECT_EQ(OLVANE_INVALID_ARGUMENT, olvane_date_set(nullptr, "1850"));
    const Answer answer = familyOf(callbacks, 17);
    EXPECT_EQ(OLVANE_INVALID_ARGUMENT, olvane_layout_text(answer.layout.get(), nullptr, &count));
    EXPECT_EQ(OLVANE_INVALID_ARGUMENT, olvane_layout_records(answer.layout.get(), &records, nullptr));
    EXPECT_EQ(OLVANE_INVALID_ARGUMENT, olvane_layout_host_code(answer.layout.get(), nullptr));
    olvane_layout_free(nullptr);
}

TEST(CFailures, ofNullListsAndDatesAreReported) {
    CallbackHost host(family("17+42"));
    olvane_host callbacks = host.callbacks();
    callbacks.children_of = [](void*, std::int64_t, olvane_person_list* children) {
        EXPECT_EQ(OLVANE_INVALID_ARGUMENT, olvane_person_list_append(children, nullptr, 3));
        EXPECT_EQ(OLVANE_OK, olvane_person_list_append(children, nullptr, 0));
        return 0;
    };
    callbacks.date_of = [](void*, std::int64_t, int, olvane_date* date) {
        EXPECT_EQ(OLVANE_OK, olvane_date_set(date, nullptr));
        return 0;
    };
    EXPECT_EQ(familyOf(host.callbacks(), 17).text(), familyOf(callbacks, 17).text());
}

TEST(CFailures, haveATextForEachStatus) {
    std::set<std::string> texts;
    for (int status = OLVANE_OK; status <= OLVANE_UNREADABLE; ++status) {
        texts.insert(olvane_status_text(static_cast<olvane_status>(status)));
    }
    EXPECT_EQ(10u, texts.size());
    const std::string beyond = olvane_status_text(static_cast<olvane_status>(10));
    EXPECT_EQ(0u, texts.count(beyond));
    EXPECT_NE(std::string::npos, beyond.find("not a status"));
}

TEST(CFocus, isAnIdOf1To2147483647) {
    CallbackHost host(family(kThreeGenerations));
    for (const std::int64_t id : {std::int64_t{0}, std::int64_t{-17}, std::int64_t{1} << 32,
                                  17 + (std::int64_t{5} << 32), OLVANE_PERSON_NOT_FOUND}) {
        const Answer answer = familyOf(host.callbacks(), id);
        EXPECT_EQ(OLVANE_INVALID_PERSON, answer.status) << id;
        EXPECT_EQ("", answer.text());
        EXPECT_TRUE(answer.records().empty());
    }
}

struct NestedHost {
    CallbackHost host;
    olvane_host callbacks;
    olvane_status inner = OLVANE_OK;
};

TEST(CNesting, isRefusedAndLeavesTheOuterLayoutAlone) {
    NestedHost nested{CallbackHost(family("17")), {}};
    olvane_host callbacks = nested.host.callbacks();
    nested.callbacks = callbacks;
    callbacks.context = &nested;
    callbacks.sex_of = [](void* context, std::int64_t, std::int32_t*) {
        NestedHost& outer = *static_cast<NestedHost*>(context);
        outer.inner = familyOf(outer.callbacks, 17).status;
        return 1;
    };
    EXPECT_EQ(OLVANE_HOST_FAILED, familyOf(callbacks, 17).status);
    EXPECT_EQ(OLVANE_NESTED_CALL, nested.inner);
    EXPECT_EQ(OLVANE_OK, familyOf(nested.callbacks, 17).status);
}

// Of a host, of a table and of a file, as a layout, a picture and a drawing, asked by a callback of a layout and of a picture.
TEST(CNesting, isRefusedWhateverIsAskedFor) {
    struct Asked {
        CallbackHost host{family("17")};
        olvane_host callbacks = host.callbacks();
        olvane_family* table = nullptr;
        olvane_file* file = nullptr;
        std::vector<olvane_status> statuses;
    } asked;
    const olvane_person_row row = {17, 0, 0, 0, 0, nullptr, nullptr, nullptr, nullptr};
    ASSERT_EQ(OLVANE_OK, olvane_family_create(nullptr, &asked.table, nullptr));
    ASSERT_EQ(OLVANE_OK, olvane_family_add_person(asked.table, &row, nullptr));
    const std::string gedcom = "0 HEAD\n0 @I1@ INDI\n1 SEX M\n0 TRLR\n";
    ASSERT_EQ(OLVANE_OK, olvane_file_read(gedcom.data(), gedcom.size(), "x.ged", 0, &asked.file, nullptr));
    olvane_host callbacks = asked.host.callbacks();
    callbacks.context = &asked;
    callbacks.sex_of = [](void* context, std::int64_t, std::int32_t*) {
        Asked& within = *static_cast<Asked*>(context);
        olvane_layout* layout = nullptr;
        olvane_picture* picture = nullptr;
        olvane_result* svg[2] = {};
        within.statuses = {olvane_layout_family(&within.callbacks, 17, nullptr, &layout),
                           olvane_view(within.table, OLVANE_VIEW_FAMILY, 17, nullptr, &layout),
                           olvane_picture_of_host(&within.callbacks, 17, nullptr, &picture),
                           olvane_picture_of_family(within.table, 17, nullptr, &picture),
                           olvane_picture_of_file(within.file, 1, nullptr, &picture),
                           olvane_draw(within.file, 1, nullptr, &svg[0]),
                           olvane_draw_family(within.table, 17, nullptr, &svg[1])};
        for (olvane_result* result : svg) olvane_result_free(result);
        return 1;
    };
    const std::vector<olvane_status> refused(7, OLVANE_NESTED_CALL);
    EXPECT_EQ(OLVANE_HOST_FAILED, familyOf(callbacks, 17).status);
    EXPECT_EQ(refused, asked.statuses);
    asked.statuses.clear();
    olvane_picture* picture = nullptr;
    EXPECT_EQ(OLVANE_HOST_FAILED, olvane_picture_of_host(&callbacks, 17, nullptr, &picture));
    EXPECT_EQ(refused, asked.statuses);
    olvane_picture_free(picture);
    EXPECT_EQ(OLVANE_OK, olvane_picture_of_family(asked.table, 17, nullptr, &picture));
    olvane_picture_free(picture);
    olvane_family_free(asked.table);
    olvane_file_free(asked.file);
}

// A source of the C++ engine that lays out another family by the C library within its questions.
class AskingManager : public support::CaseManager {
public:
    using CaseManager::CaseManager;

    std::int64_t fatherForPersonWithID(std::int64_t id) override {
        const Answer answer = familyOf(host.callbacks(), 3);
        allAreRight = allAreRight && answer.status == OLVANE_OK && answer.text() == innerText;
        return CaseManager::fatherForPersonWithID(id);
    }

    CallbackHost host{family("3: 5 6")};
    std::string innerText = familyOf(host.callbacks(), 3).text();
    bool allAreRight = true;
};

// The library has an engine of its own, with unknown parents of its own: neither layout sees the other.
TEST(CNesting, withinACheckedCallInCppLeavesBothLayoutsAlone) {
    const auto manager = std::make_shared<AskingManager>(family("17+42: 5 6"));
    const auto result = olvane::checkedLayout(olvane::TypedLayout::View::family, 17, manager);
    EXPECT_TRUE(result.isOk()) << result.reason.text();
    EXPECT_TRUE(manager->allAreRight);
    const auto alone = std::make_shared<support::CaseManager>(family("17+42: 5 6"));
    EXPECT_EQ(olvane::checkedLayout(olvane::TypedLayout::View::family, 17, alone).layout.text,
              result.layout.text);
}

TEST(CThreads, layOutTheirOwnFamiliesAtOnce) {
    const std::vector<CaseFile> families = {family("17"), family(kThreeGenerations)};
    std::atomic<int> differences{0};
    const auto run = [&differences](const CaseFile& input) {
        const std::string expected = support::layoutText(input);
        for (int i = 0; i < 100; ++i) differences += layoutOf(input).text() == expected ? 0 : 1;
    };
    std::thread first([&] { run(families[0]); });
    std::thread second([&] { run(families[1]); });
    first.join();
    second.join();
    EXPECT_EQ(0, differences);
}

#ifdef OLVANE_FRAMES_ARE_PLAIN
// A line of fathers, as long as a pedigree may be.
void* layOutMostGenerations(void* status) {
    CaseFile input;
    input.focus = 1;
    for (std::int64_t person = 1; person < OLVANE_MOST_GENERATIONS; ++person) {
        input.fathers[person] = person + 1;
        input.children[person + 1] = {person};
    }
    CallbackHost host(input);
    olvane_options options;
    olvane_options_default(&options);
    options.generations = OLVANE_MOST_GENERATIONS;
    options.flag_depth = OLVANE_MOST_GENERATIONS;
    *static_cast<olvane_status*>(status) = pedigreeOf(host.callbacks(), 1, &options).status;
    return nullptr;
}

TEST(CThreads, withHalfAMegabyteOfStackHoldMostGenerations) {
    pthread_attr_t attributes;
    ASSERT_EQ(0, pthread_attr_init(&attributes));
    ASSERT_EQ(0, pthread_attr_setstacksize(&attributes, std::size_t{512} * 1024));
    pthread_t thread;
    olvane_status status = OLVANE_LAYOUT_FAILED;
    ASSERT_EQ(0, pthread_create(&thread, &attributes, layOutMostGenerations, &status));
    ASSERT_EQ(0, pthread_join(thread, nullptr));
    EXPECT_EQ(OLVANE_OK, status);
    pthread_attr_destroy(&attributes);
}
#endif

TEST(CStructs, ofAnotherSizeAreRefused) {
    CallbackHost host(family("17"));
    olvane_host callbacks = host.callbacks();
    olvane_options options;
    ASSERT_EQ(OLVANE_OK, olvane_options_default(&options));
    EXPECT_EQ(OLVANE_OK, familyOf(callbacks, 17, &options).status);
    for (const std::size_t change : {std::size_t{8}, ~std::size_t{7}, ~sizeof(olvane_host) + 1}) {
        olvane_host wrongHost = callbacks;
        wrongHost.struct_size += change;
        EXPECT_EQ(OLVANE_INVALID_ARGUMENT, familyOf(wrongHost, 17).status);
        olvane_options wrongOptions = options;
        wrongOptions.struct_size += change;
        EXPECT_EQ(OLVANE_INVALID_ARGUMENT, familyOf(callbacks, 17, &wrongOptions).status);
    }
}

TEST(CVersion, hasThreeNumbers) {
    EXPECT_EQ(std::string(OLVANE_EXPECTED_VERSION), olvane_version());
}

TEST(CVersion, ofTheHeadersIsThatOfTheLibrary) {
    const std::string macros = std::to_string(OLVANE_VERSION_MAJOR) + "." +
                               std::to_string(OLVANE_VERSION_MINOR) + "." +
                               std::to_string(OLVANE_VERSION_PATCH);
    EXPECT_EQ(macros, olvane_version());
}

}  // namespace
