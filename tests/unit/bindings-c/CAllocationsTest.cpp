// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Memory that runs out at any moment of a call is a status, and nothing is lost with it.

#include <algorithm>
#include <cstdint>
#include <fstream>
#include <functional>
#include <memory>
#include <set>
#include <string>

#include <gtest/gtest.h>

#include <olvane_file.h>
#include <olvane_picture.h>

#include <unit/bindings-c/CallbackHost.h>
#include <unit/boundary/AllocationCountdown.h>
#include <unit/boundary/DisturbedRequests.h>

namespace {

using unit::CallbackHost;

// A host that allocates nothing of its own, so that every allocation is the library's.
olvane_host bareHost() {
    olvane_host host = {};
    host.struct_size = sizeof host;
    host.father_of = [](void*, std::int64_t, std::int64_t*) { return 0; };
    host.mother_of = host.father_of;
    host.spouses_of = [](void*, std::int64_t person, olvane_person_list* spouses) {
        const std::int64_t spouse = person == 17 ? 42 : 17;
        if (person == 17 || person == 42) olvane_person_list_append(spouses, &spouse, 1);
        return 0;  // a callback that does not look
    };
    host.children_of = [](void*, std::int64_t person, olvane_person_list* children) {
        const std::int64_t child = 5;
        if (person == 17 || person == 42) olvane_person_list_append(children, &child, 1);
        return 0;
    };
    host.is_preferred_spouse = [](void*, std::int64_t, std::int64_t, int*) { return 0; };
    host.is_dead = [](void*, std::int64_t, int*) { return 0; };
    host.date_of = [](void*, std::int64_t, int, olvane_date* date) {
        olvane_date_set(date, "a date that is too long to lie within its own text");
        return 0;
    };
    host.sex_of = [](void*, std::int64_t person, std::int32_t* sex) {
        *sex = person == 17 ? 0 : 1;
        return 0;
    };
    return host;
}

// The same, but it looks, and reports a failure as its own.
olvane_host lookingHost() {
    olvane_host host = bareHost();
    host.spouses_of = [](void*, std::int64_t person, olvane_person_list* spouses) {
        const std::int64_t spouse = person == 17 ? 42 : 17;
        if (person != 17 && person != 42) return 0;
        return olvane_person_list_append(spouses, &spouse, 1) == OLVANE_OK ? 0 : 1;
    };
    host.children_of = [](void*, std::int64_t person, olvane_person_list* children) {
        const std::int64_t child = 5;
        if (person != 17 && person != 42) return 0;
        return olvane_person_list_append(children, &child, 1) == OLVANE_OK ? 0 : 1;
    };
    host.date_of = [](void*, std::int64_t, int, olvane_date* date) {
        const char* const text = "a date that is too long to lie within its own text";
        return olvane_date_set(date, text) == OLVANE_OK ? 0 : 1;
    };
    return host;
}

typedef std::function<unit::Answer()> Layout;

std::string textOf(const Layout& layOut) {
    const unit::Answer answer = layOut();
    EXPECT_EQ(OLVANE_OK, answer.status);
    return answer.text();
}

// Each allocation of a request fails in turn; behind each failure the request is whole again. Where the host's own
// answers allocate as well, it may be the host that fails.
void expectAStatusWhereverMemoryRunsOut(const Layout& layOut,
                                        const std::set<olvane_status>& expectedStatuses) {
    const std::string expected = textOf(layOut);
    const std::int64_t before = unit::allocationsMade();
    layOut();
    const std::int64_t needed = unit::allocationsMade() - before;
    ASSERT_GT(needed, 20);
    for (std::int64_t n = 1; n <= needed; ++n) {
        const std::int64_t outstanding = unit::allocationsOutstanding();
        olvane_status status = OLVANE_OK;
        {
            const unit::AllocationFailure failure(n);
            status = layOut().status;
        }
        EXPECT_EQ(outstanding, unit::allocationsOutstanding()) << n;
        EXPECT_EQ(1u, expectedStatuses.count(status)) << n << ": " << olvane_status_text(status);
        ASSERT_EQ(expected, textOf(layOut)) << "behind a failure of allocation " << n;
    }
}

// Whether the host looks.
class CMemory : public testing::TestWithParam<bool> {};

TEST_P(CMemory, thatRunsOutAnywhereIsAStatusInBothViews) {
    const olvane_host host = GetParam() ? lookingHost() : bareHost();
    expectAStatusWhereverMemoryRunsOut([&host] { return unit::familyOf(host, 17); }, {OLVANE_OUT_OF_MEMORY});
    expectAStatusWhereverMemoryRunsOut([&host] { return unit::pedigreeOf(host, 17); },
                                       {OLVANE_OUT_OF_MEMORY});
}

TEST(CMemoryOfGoldenCases, thatRunsOutAnywhereIsAStatus) {
    for (const unit::DisturbedRequest& request : unit::disturbedRequests()) {
        SCOPED_TRACE(request.name);
        CallbackHost host(request.input);
        const olvane_host callbacks = host.callbacks();
        olvane_options options;
        olvane_options_default(&options);
        options.generations = std::max(1, request.input.maxGenerations);
        options.flag_depth = request.input.maxStackDepth;
        const auto view =
            request.input.view == support::CaseView::pedigree ? unit::pedigreeOf : unit::familyOf;
        expectAStatusWhereverMemoryRunsOut([&] { return view(callbacks, request.input.focus, &options); },
                                           {OLVANE_OUT_OF_MEMORY, OLVANE_HOST_FAILED});
    }
}

// One call that makes a thing out of what is there already, and frees it.
typedef std::function<olvane_status()> MakeOne;

// Each allocation fails in turn, and nothing is left behind. What a sort or a cache does without may succeed all the same.
void expectNothingLeftWhereverMemoryRunsOut(const MakeOne& makeOne, int doneAllTheSame) {
    ASSERT_EQ(OLVANE_OK, makeOne());  // what happens for the first time only
    const std::int64_t before = unit::allocationsMade();
    makeOne();
    const std::int64_t needed = unit::allocationsMade() - before;
    ASSERT_GT(needed, 20);
    int madeAllTheSame = 0;
    for (std::int64_t n = 1; n <= needed; ++n) {
        const std::int64_t outstanding = unit::allocationsOutstanding();
        olvane_status status = OLVANE_OK;
        {
            const unit::AllocationFailure failure(n);
            status = makeOne();
        }
        EXPECT_EQ(outstanding, unit::allocationsOutstanding()) << n;
        if (status == OLVANE_OK) {
            ++madeAllTheSame;
        } else {
            EXPECT_EQ(OLVANE_OUT_OF_MEMORY, status) << n;
        }
    }
    EXPECT_GE(doneAllTheSame, madeAllTheSame);
}

// A stable sort does without its buffer.
constexpr int kBuffersOfSorts = 2;

TEST(CMemoryOfPictures, thatRunsOutAnywhereIsAStatusAndLeavesNothing) {
    const unit::Answer answer = unit::familyOf(lookingHost(), 17);
    const auto makeOne = [&answer] {
        olvane_picture* picture = nullptr;
        const olvane_status status = olvane_picture_create(answer.layout.get(), nullptr, 1, &picture);
        EXPECT_EQ(status == OLVANE_OK, picture != nullptr);
        olvane_picture_free(picture);
        return status;
    };
    expectNothingLeftWhereverMemoryRunsOut(makeOne, kBuffersOfSorts);
}

TEST(CMemoryOfPictures, thatRunsOutWhileAHostIsAskedIsAStatusAndLeavesNothing) {
    const olvane_host host = lookingHost();
    for (std::int32_t view = OLVANE_PICTURE_FAMILY; view <= OLVANE_PICTURE_EVERYBODY; ++view) {
        SCOPED_TRACE(view);
        olvane_picture_options options;
        ASSERT_EQ(OLVANE_OK, olvane_picture_options_default(view, &options));
        options.other = 5;
        const auto makeOne = [&host, &options] {
            olvane_picture* picture = nullptr;
            const olvane_status status = olvane_picture_of_host(&host, 17, &options, &picture);
            olvane_picture_free(picture);
            return status == OLVANE_HOST_FAILED ? OLVANE_OUT_OF_MEMORY : status;  // the host reports it, too
        };
        expectNothingLeftWhereverMemoryRunsOut(makeOne, kBuffersOfSorts);
    }
}

// A couple and their child, who was born in 1990.
const std::string kFile =
    "0 HEAD\n1 GEDC\n2 VERS 5.5.1\n1 CHAR UTF-8\n"
    "0 @I1@ INDI\n1 NAME Ada /Berg/\n1 SEX F\n1 BIRT\n2 DATE 1 MAY 1960\n2 PLAC Ulm\n1 FAMS @F1@\n"
    "0 @I2@ INDI\n1 NAME Bo /Carl/\n1 SEX M\n1 FAMS @F1@\n"
    "0 @I3@ INDI\n1 NAME Cy /Carl/\n1 SEX M\n1 BIRT\n2 DATE 1990\n1 FAMC @F1@\n"
    "0 @F1@ FAM\n1 HUSB @I2@\n1 WIFE @I1@\n1 CHIL @I3@\n0 TRLR\n";

struct FreeFile {
    void operator()(olvane_file* file) const { olvane_file_free(file); }
};
typedef std::unique_ptr<olvane_file, FreeFile> FilePointer;

FilePointer readFile() {
    olvane_file* file = nullptr;
    olvane_file_read(kFile.data(), kFile.size(), "here.ged", OLVANE_READ_FACTS, &file, nullptr);
    return FilePointer(file);
}

TEST(CMemoryOfFiles, thatRunsOutWhileOneIsReadLeavesNothing) {
    const auto makeOne = [] {
        olvane_file* file = nullptr;
        olvane_result* failure = nullptr;
        const olvane_status status =
            olvane_file_read(kFile.data(), kFile.size(), "here.ged", OLVANE_READ_FACTS, &file, &failure);
        EXPECT_EQ(status == OLVANE_OK, file != nullptr);
        olvane_file_free(file);
        olvane_result_free(failure);
        return status;
    };
    expectNothingLeftWhereverMemoryRunsOut(makeOne, kBuffersOfSorts);
}

TEST(CMemoryOfFiles, thatRunsOutWhileOneIsDrawnFromItsPathLeavesNothing) {
    const std::string path = testing::TempDir() + "c_allocations_test.ged";
    std::ofstream(path) << kFile;
    for (const char* view : {"family", "hourglass", "kinship", "fan"}) {
        SCOPED_TRACE(view);
        olvane_draw_options options = {};
        options.struct_size = sizeof options;
        options.view = view;
        options.to = 2;
        options.places = 1;
        options.hide_living = 1;
        options.year = 2020;
        const auto makeOne = [&] {
            olvane_result* svg = nullptr;
            const olvane_status status = olvane_draw_file(path.c_str(), "Cy Carl", &options, &svg);
            olvane_result_free(svg);
            return status;
        };
        expectNothingLeftWhereverMemoryRunsOut(makeOne, kBuffersOfSorts);
    }
}

TEST(CMemoryOfFiles, thatRunsOutInAQuestionLeavesNothing) {
    const auto kinship = [] {
        const FilePointer file = readFile();
        olvane_result* json = nullptr;
        const olvane_status status =
            file ? olvane_file_kinship(file.get(), 1, 3, &json) : OLVANE_OUT_OF_MEMORY;
        olvane_result_free(json);
        return status;
    };
    const auto remarks = [] {
        const FilePointer file = readFile();
        olvane_result* json = nullptr;
        const olvane_status status = file ? olvane_file_remarks(file.get(), &json) : OLVANE_OUT_OF_MEMORY;
        olvane_result_free(json);
        return status;
    };
    const auto table = [] {
        const FilePointer file = readFile();
        olvane_family* family = nullptr;
        olvane_result* json = nullptr;
        olvane_status status = file ? olvane_file_family(file.get(), &family) : OLVANE_OUT_OF_MEMORY;
        if (status == OLVANE_OK) status = olvane_family_kinship(family, 1, 3, &json);
        olvane_family_free(family);
        olvane_result_free(json);
        return status;
    };
    for (const MakeOne& makeOne : {MakeOne(kinship), MakeOne(remarks), MakeOne(table)}) {
        expectNothingLeftWhereverMemoryRunsOut(makeOne, kBuffersOfSorts);
    }
}

// Every view of a file that is read again each time, so that what it keeps is made again as well.
TEST(CMemoryOfFiles, thatRunsOutInAPictureLeavesNothing) {
    for (std::int32_t view = OLVANE_PICTURE_FAMILY; view <= OLVANE_PICTURE_EVERYBODY; ++view) {
        SCOPED_TRACE(view);
        olvane_picture_options options;
        ASSERT_EQ(OLVANE_OK, olvane_picture_options_default(view, &options));
        options.other = 2;
        options.hide_living = 1;
        options.year = 2020;
        const auto makeOne = [&options] {
            const FilePointer file = readFile();
            olvane_picture* picture = nullptr;
            const olvane_status status =
                file ? olvane_picture_of_file(file.get(), 3, &options, &picture) : OLVANE_OUT_OF_MEMORY;
            olvane_picture_free(picture);
            return status;
        };
        expectNothingLeftWhereverMemoryRunsOut(makeOne, kBuffersOfSorts);
    }
}

INSTANTIATE_TEST_SUITE_P(Hosts, CMemory, testing::Bool(),
                         [](const auto& tested) { return tested.param ? "looking" : "heedless"; });

}  // namespace
