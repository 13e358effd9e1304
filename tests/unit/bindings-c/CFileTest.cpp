// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane_file.h>

#include <gtest/gtest.h>

#include <cstring>
#include <fstream>
#include <memory>
#include <string>
#include <thread>
#include <vector>

namespace {

// A couple, their child, and a person with an impossible life.
const char* const kFamily =
    "0 HEAD\n1 GEDC\n2 VERS 5.5.1\n1 CHAR UTF-8\n"
    "0 @I1@ INDI\n1 NAME Ada <&> /Berg/\n1 SEX F\n1 BIRT\n2 DATE 1 MAY 1830\n2 PLAC Ulm\n1 FAMS @F1@\n"
    "0 @I2@ INDI\n1 NAME Bo /Carl/\n1 SEX M\n1 FAMS @F1@\n"
    "0 @I3@ INDI\n1 NAME Cy /Carl/\n1 SEX M\n1 BIRT\n2 DATE 1860\n1 DEAT\n2 DATE 1850\n1 FAMC @F1@\n"
    "0 @F1@ FAM\n1 HUSB @I2@\n1 WIFE @I1@\n1 CHIL @I3@\n0 TRLR\n";

struct FreeFile {
    void operator()(olvane_file* file) const { olvane_file_free(file); }
};
typedef std::unique_ptr<olvane_file, FreeFile> File;

File opened(const std::string& bytes, std::uint32_t flags = 0) {
    olvane_file* file = nullptr;
    EXPECT_EQ(OLVANE_OK, olvane_file_read(bytes.data(), bytes.size(), "here.ged", flags, &file, nullptr));
    return File(file);
}

std::string taken(olvane_result* result) {
    std::size_t length = 0;
    const char* const text = olvane_result_text(result, &length);
    const std::string copy(text, length);
    EXPECT_EQ(length, std::strlen(text));
    olvane_result_free(result);
    return copy;
}

olvane_draw_options view(const char* name) {
    olvane_draw_options options = {};
    options.struct_size = sizeof options;
    options.view = name;
    return options;
}

// The status and the text of a drawing.
std::pair<olvane_status, std::string> drawn(const File& file, std::int64_t focus,
                                            const olvane_draw_options* options) {
    olvane_result* result = nullptr;
    const olvane_status status = olvane_draw(file.get(), focus, options, &result);
    return {status, taken(result)};
}

}  // namespace

TEST(CFile, drawsAPersonInOneCall) {
    const std::string path = testing::TempDir() + "c_file_test.ged";
    std::ofstream(path) << kFamily;
    olvane_result* svg = nullptr;
    ASSERT_EQ(OLVANE_OK, olvane_draw_file(path.c_str(), "Cy Carl", nullptr, &svg));
    const std::string text = taken(svg);
    EXPECT_NE(std::string::npos, text.find("<svg "));
    EXPECT_NE(std::string::npos, text.find("Ada &lt;&amp;&gt;"));
    const File file = opened(kFamily);
    EXPECT_EQ(text, drawn(file, 3, nullptr).second);
}

TEST(CFile, readsPlacesWhereTheyAreDrawn) {
    olvane_draw_options options = view("family");
    options.places = 1;
    EXPECT_EQ(std::string::npos, drawn(opened(kFamily), 1, &options).second.find("Ulm"));
    EXPECT_NE(std::string::npos, drawn(opened(kFamily, OLVANE_READ_FACTS), 1, &options).second.find("Ulm"));
}

TEST(CFile, drawsEveryView) {
    const File file = opened(kFamily);
    for (const char* name : {"family", "pedigree", "near", "ancestors", "descendants", "hourglass",
                             "relatives", "fan", "everybody"}) {
        const olvane_draw_options options = view(name);
        const auto [status, text] = drawn(file, 3, &options);
        EXPECT_EQ(OLVANE_OK, status) << name;
        EXPECT_NE(std::string::npos, text.find(">Cy")) << name;
    }
    olvane_draw_options kinship = view("kinship");
    kinship.to = 1;
    EXPECT_EQ(OLVANE_OK, drawn(file, 3, &kinship).first);
}

TEST(CFile, hidesEveryoneWhoMayBeLiving) {
    const File file = opened(
        "0 HEAD\n1 GEDC\n2 VERS 5.5.1\n1 CHAR UTF-8\n"
        "0 @I1@ INDI\n1 NAME Ada /Berg/\n1 BIRT\n2 DATE 1990\n0 TRLR\n");
    olvane_draw_options options = view("family");
    EXPECT_NE(std::string::npos, drawn(file, 1, &options).second.find("Ada"));
    options.hide_living = 1;
    EXPECT_EQ(std::string::npos, drawn(file, 1, &options).second.find("Ada"));
    options.year = 2099;
    EXPECT_EQ(std::string::npos, drawn(file, 1, &options).second.find("Ada"));
    options.year = 2100;
    EXPECT_NE(std::string::npos, drawn(file, 1, &options).second.find("Ada"));
    options.year = 10000;
    EXPECT_EQ("year is '10000', and takes 1 to 9999, or 0 for the present one",
              drawn(file, 1, &options).second);
}

TEST(CFile, saysWhatIsWrong) {
    olvane_result* failure = nullptr;
    olvane_file* file = nullptr;
    EXPECT_EQ(OLVANE_UNREADABLE, olvane_file_open("/no/such/file.ged", 0, &file, &failure));
    EXPECT_EQ(nullptr, file);
    EXPECT_EQ("/no/such/file.ged: does not exist", taken(failure));
    EXPECT_EQ(OLVANE_UNREADABLE, olvane_file_read("nothing", 7, "here.ged", 0, &file, nullptr));
    EXPECT_EQ(OLVANE_INVALID_ARGUMENT, olvane_file_read(kFamily, 7, "here.ged", 2, &file, nullptr));

    const File known = opened(kFamily);
    std::int64_t person = 17;
    EXPECT_EQ(OLVANE_INVALID_PERSON, olvane_file_find(known.get(), "Carl", &person, &failure));
    EXPECT_EQ(0, person);
    EXPECT_EQ("here.ged: 'Carl' may be any of 2 persons", taken(failure));
    EXPECT_EQ(OLVANE_INVALID_PERSON, olvane_file_find(known.get(), "Dora", &person, &failure));
    EXPECT_EQ("here.ged: no person is called 'Dora'", taken(failure));
    EXPECT_EQ(OLVANE_OK, olvane_file_find(known.get(), "@I3@", &person, nullptr));
    EXPECT_EQ(3, person);

    const olvane_draw_options paper = view("paper");
    EXPECT_EQ(OLVANE_INVALID_ARGUMENT, drawn(known, 1, &paper).first);
    EXPECT_EQ(0u, drawn(known, 1, &paper).second.find("view is 'paper', and takes family, "));
    EXPECT_EQ("there is no person 4", drawn(known, 4, nullptr).second);
    EXPECT_EQ("there is no person 4294967297", drawn(known, 4294967297, nullptr).second);
    olvane_draw_options options = view("family");
    options.up = -1;
    EXPECT_EQ(OLVANE_INVALID_ARGUMENT, drawn(known, 1, &options).first);
    options = view("pedigree");
    options.generations = 13;
    EXPECT_EQ(OLVANE_INVALID_ARGUMENT, drawn(known, 1, &options).first);
    options = view("kinship");
    EXPECT_EQ("there is no person 0", drawn(known, 1, &options).second);
    options = view("family");
    options.struct_size -= 1;
    EXPECT_EQ(OLVANE_INVALID_ARGUMENT, drawn(known, 1, &options).first);
}

TEST(CFile, laysOutAsItsTableDoes) {
    const File file = opened(kFamily);
    EXPECT_EQ(3u, olvane_file_person_count(file.get()));
    olvane_family* table = nullptr;
    ASSERT_EQ(OLVANE_OK, olvane_file_family(file.get(), &table));
    for (const std::int32_t kind : {OLVANE_VIEW_FAMILY, OLVANE_VIEW_PEDIGREE}) {
        olvane_layout* ofFile = nullptr;
        olvane_layout* ofTable = nullptr;
        ASSERT_EQ(OLVANE_OK, olvane_file_layout(file.get(), kind, 3, nullptr, &ofFile));
        ASSERT_EQ(OLVANE_OK, olvane_view(table, kind, 3, nullptr, &ofTable));
        const char* texts[2];
        olvane_layout_text(ofFile, &texts[0], nullptr);
        olvane_layout_text(ofTable, &texts[1], nullptr);
        EXPECT_STREQ(texts[0], texts[1]);
        EXPECT_EQ(0, std::strncmp(texts[0], "3:", 2));
        olvane_layout_free(ofFile);
        olvane_layout_free(ofTable);
    }
    olvane_layout* layout = nullptr;
    EXPECT_EQ(OLVANE_INVALID_PERSON, olvane_file_layout(file.get(), 0, 4, nullptr, &layout));
    olvane_layout_free(layout);
    EXPECT_EQ(OLVANE_INVALID_ARGUMENT, olvane_file_layout(file.get(), 2, 1, nullptr, &layout));
    olvane_family_free(table);
}

TEST(CFile, drawsATableByItsNamesAndYears) {
    olvane_family* table = nullptr;
    ASSERT_EQ(OLVANE_OK, olvane_file_family(opened(kFamily).get(), &table));
    olvane_result* svg = nullptr;
    EXPECT_EQ(OLVANE_OK, olvane_draw_family(table, 3, nullptr, &svg));
    const std::string text = taken(svg);
    EXPECT_NE(std::string::npos, text.find(">Berg<"));
    EXPECT_NE(std::string::npos, text.find("1860"));
    EXPECT_EQ(OLVANE_INVALID_PERSON, olvane_draw_family(table, 4, nullptr, &svg));
    EXPECT_EQ("there is no person 4", taken(svg));
    olvane_family_free(table);
}

TEST(CFile, givesKinshipAndRemarksAsJson) {
    const File file = opened(kFamily);
    olvane_result* json = nullptr;
    ASSERT_EQ(OLVANE_OK, olvane_file_kinship(file.get(), 3, 1, &json));
    EXPECT_NE(std::string::npos, taken(json).find("\"en\": \"mother\""));
    EXPECT_EQ(OLVANE_INVALID_PERSON, olvane_file_kinship(file.get(), 3, 0, &json));
    EXPECT_EQ("there is no person 0", taken(json));
    ASSERT_EQ(OLVANE_OK, olvane_file_remarks(file.get(), &json));
    EXPECT_EQ(
        "[\n{\"kind\": \"diedBeforeBirth\", \"person\": 3, \"family\": null, "
        "\"text\": \"Cy Carl died before being born\"}]\n",
        taken(json));
}

TEST(CFile, isAskedByManyThreads) {
    const File file = opened(kFamily);
    const std::string expected = drawn(file, 3, nullptr).second;
    std::vector<std::thread> threads;
    std::vector<int> same(4, 0);
    for (std::size_t i = 0; i < same.size(); ++i) {
        threads.emplace_back([&, i] {
            const File& shared = file;
            olvane_result* json = nullptr;
            olvane_file_kinship(shared.get(), 1, 3, &json);
            olvane_result_free(json);
            std::int64_t person = 0;
            olvane_file_find(shared.get(), "Cy", &person, nullptr);
            same[i] = person == 3 && drawn(shared, person, nullptr).second == expected;
        });
    }
    for (std::thread& thread : threads) thread.join();
    EXPECT_EQ(std::vector<int>(4, 1), same);
}

TEST(CFile, takesNothingForAnArgument) {
    olvane_result* result = nullptr;
    olvane_file* file = nullptr;
    EXPECT_EQ(OLVANE_INVALID_ARGUMENT, olvane_draw_file(nullptr, "1", nullptr, &result));
    EXPECT_EQ(OLVANE_INVALID_ARGUMENT, olvane_draw_file("x", nullptr, nullptr, &result));
    EXPECT_EQ(OLVANE_INVALID_ARGUMENT, olvane_draw_file("x", "1", nullptr, nullptr));
    EXPECT_EQ(OLVANE_INVALID_ARGUMENT, olvane_draw(nullptr, 1, nullptr, &result));
    EXPECT_EQ(OLVANE_INVALID_ARGUMENT, olvane_draw_family(nullptr, 1, nullptr, &result));
    EXPECT_EQ(OLVANE_INVALID_ARGUMENT, olvane_file_open(nullptr, 0, &file, nullptr));
    EXPECT_EQ(OLVANE_INVALID_ARGUMENT, olvane_file_remarks(nullptr, &result));
    EXPECT_EQ(0u, olvane_file_person_count(nullptr));
    EXPECT_STREQ("", olvane_result_text(nullptr, nullptr));
    olvane_result_free(nullptr);
    olvane_file_free(nullptr);
}
