// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/kin/PersonIndex.h>

#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <nlohmann/json.hpp>

#include <algorithm>
#include <fstream>
#include <map>
#include <random>

#include <olvane/kin/Folding.h>

using namespace olvane;
using namespace olvane::kin;
using nlohmann::json;

namespace {

const json& fixture() {
    static const json kFixture = json::parse(std::ifstream(OLVANE_FIXTURES "/search.json"));
    return kFixture;
}

Family familyOf(const json& persons) {
    static const std::map<std::string, NameKind> kKinds{
        {"full", NameKind::full},      {"given", NameKind::given},   {"surname", NameKind::surname},
        {"prefix", NameKind::prefix},  {"suffix", NameKind::suffix}, {"nickname", NameKind::nickname},
        {"married", NameKind::married}};
    Family family;
    for (const json& person : persons) {
        const std::string birth = person.value("birth", "");
        const std::string written = person.value("birthWritten", birth);
        const std::string death = person.value("death", "");
        PersonRow row;
        row.id = person["id"];
        row.sex = person["sex"] == "m" ? Sex::male : Sex::female;
        row.birth = birth;
        row.birthWritten = written;
        row.death = death;
        family.addPerson(row);
        std::vector<std::string> texts;
        for (const json& name : person["names"]) texts.push_back(name[1]);
        std::vector<NamePart> parts;
        for (std::size_t i = 0; i < texts.size(); ++i)
            parts.push_back({kKinds.at(person["names"][i][0]), texts[i]});
        family.setNames(row.id, parts);
        family.setField(row.id, "xref", person["xref"].get<std::string>());
        for (const json& field : person.value("fields", json::array()))
            family.setField(row.id, field[0].get<std::string>(), field[1].get<std::string>());
    }
    for (const json& person : persons) {
        const std::vector<std::int64_t> spouses = person.value("spouses", std::vector<std::int64_t>());
        family.setSpouses(person["id"], spouses, 0);
    }
    return family;
}

std::string text(const SearchHit& hit) {
    constexpr const char* kIn[] = {"identifier", "name",  "nickname", "marriedName", "title",
                                   "birth",      "death", "place",    "other"};
    constexpr const char* kFit[] = {"whole", "begins", "within", "similar"};
    std::string out;
    for (const SearchReason& reason : hit.reasons) {
        out += (out.empty() ? "" : ", ") + std::string(kIn[static_cast<std::size_t>(reason.in)]) + " " +
               kFit[static_cast<std::size_t>(reason.fit)] + " " + reason.word;
    }
    return out;
}

std::vector<std::int64_t> idsOf(const std::vector<SearchHit>& hits) {
    std::vector<std::int64_t> ids;
    ids.reserve(hits.size());
    for (const SearchHit& hit : hits) ids.push_back(hit.id);
    return ids;
}

class SearchQuery : public testing::Test {
public:
    explicit SearchQuery(const json& query) : query_(query) {}

    void TestBody() override {
        const PersonIndex index(familyOf(fixture()["persons"]));
        const auto hits = index.find(query_["text"].get<std::string>());
        EXPECT_EQ(idsOf(hits), query_["found"].get<std::vector<std::int64_t>>());
        const json why = query_.value("why", json::array());
        for (std::size_t i = 0; i < why.size() && i < hits.size(); ++i) EXPECT_EQ(text(hits[i]), why[i]);
    }

private:
    json query_;
};

// Each query is a test of its own.
const bool kRegistered = [] {
    int number = 0;
    const json all = fixture();  // outlives the loop
    for (const json& query : all["queries"]) {
        std::string name = std::to_string(++number) + "_";
        for (const char c : query["text"].get<std::string>())
            name += std::isalnum(static_cast<unsigned char>(c)) != 0 ? c : '_';
        testing::RegisterTest("SearchFixture", name.c_str(), nullptr, nullptr, __FILE__, __LINE__,
                              [query]() -> testing::Test* { return new SearchQuery(query); });
    }
    return true;
}();

}  // namespace

TEST(Folding, foldsCaseAccentsApostrophesAndSpecialLetters) {
    EXPECT_EQ(foldedForSearch("ÄÖÜ ÉÈ Çß ØŁĐÐÞÆŒ"), "aou ee css olddthaeoe");
    EXPECT_EQ(foldedForSearch("O'Brien O’Brien Oʼbrien"), "obrien obrien obrien");
    EXPECT_EQ(foldedForSearch("ŊalA Ħal"), "nala hal");
    EXPECT_EQ(foldedForSearch("Nguyễn"), "nguyen");
    EXPECT_EQ(foldedForSearch("e\u0301"), "e");
    EXPECT_EQ(foldedForSearch("ﬁn Ｆｕｌｌ"), "fin full");
    EXPECT_EQ(foldedForSearch("ΣΊΣΥΦΟΣ σίσυφος"), "σισυφοσ σισυφοσ");
    EXPECT_EQ(foldedForSearch("Ёлкин"), "елкин");
    EXPECT_EQ(foldedForSearch("İstanbul ISPARTA"), "istanbul isparta");
    EXPECT_EQ(foldedForSearch("山田"), "山田");
}

TEST(Folding, bytesThatAreNoTextAreKept) {
    EXPECT_EQ(foldedForSearch("a\xFFz\xC3"), "a\xFFz\xC3");
    EXPECT_EQ(foldedForSearch("\xF0\x9F"), "\xF0\x9F");
}

TEST(Folding, foldingTwiceChangesNothing) {
    for (char32_t code = 1; code < 0x11000; ++code) {
        if (code >= 0xD800 && code < 0xE000) continue;
        std::string letter;
        if (code < 0x80) {
            letter = static_cast<char>(code);
        } else if (code < 0x800) {
            letter = {static_cast<char>(0xC0 | (code >> 6)), static_cast<char>(0x80 | (code & 0x3F))};
        } else if (code < 0x10000) {
            letter = {static_cast<char>(0xE0 | (code >> 12)), static_cast<char>(0x80 | ((code >> 6) & 0x3F)),
                      static_cast<char>(0x80 | (code & 0x3F))};
        } else {
            letter = {static_cast<char>(0xF0 | (code >> 18)), static_cast<char>(0x80 | ((code >> 12) & 0x3F)),
                      static_cast<char>(0x80 | ((code >> 6) & 0x3F)),
                      static_cast<char>(0x80 | (code & 0x3F))};
        }
        const std::string folded = foldedForSearch(letter);
        EXPECT_EQ(foldedForSearch(folded), folded) << std::hex << static_cast<unsigned>(code);
    }
}

TEST(PersonIndex, aLimitKeepsTheBest) {
    const PersonIndex index(familyOf(fixture()["persons"]));
    EXPECT_THAT(idsOf(index.find("anna", 1)), testing::ElementsAre(6));
    EXPECT_TRUE(index.find("anna", 0).empty());
}

TEST(PersonIndex, hitsSayWhetherTheNameOrTheIdentifierWasMeant) {
    const PersonIndex index(familyOf(fixture()["persons"]));
    EXPECT_TRUE(index.find("anna")[0].isByName());
    EXPECT_FALSE(index.find("huber")[0].isByName());
    EXPECT_FALSE(index.find("grubar")[0].isByName());
    EXPECT_TRUE(index.find("I7")[0].isByIdentifier());
}

// Each person is found by each word of the name, whatever letter of it is wrong, missing or doubled.
TEST(PersonIndex, oneWrongLetterFindsThePersonStill) {
    const Family family = familyOf(fixture()["persons"]);
    const PersonIndex index(family);
    for (const std::string word : {"darwin", "wedgwood", "gruber", "fitzroy"}) {
        const auto expected = idsOf(index.find(word));
        for (std::size_t at = 0; at < word.size(); ++at) {
            for (const std::string& mistyped :
                 {word.substr(0, at) + word.substr(at + 1), word.substr(0, at) + "q" + word.substr(at + 1),
                  word.substr(0, at) + "q" + word.substr(at)}) {
                const auto found = idsOf(index.find(mistyped));
                for (const std::int64_t id : expected)
                    EXPECT_EQ(std::count(found.begin(), found.end(), id), 1) << mistyped;
            }
        }
    }
}

TEST(PersonIndex, anythingTypedIsAnswered) {
    const PersonIndex index(familyOf(fixture()["persons"]));
    std::mt19937 random(3);
    for (int i = 0; i < 2000; ++i) {
        std::string typed;
        for (auto n = random() % 12; n > 0; --n) typed += static_cast<char>(random() % 256);
        EXPECT_LE(index.find(typed).size(), 11u);
    }
    EXPECT_TRUE(index.find("99999999999999999999").empty());
    EXPECT_TRUE(index.find("-").empty());
    EXPECT_TRUE(index.find(std::string(100000, 'a')).empty());
}

TEST(PersonIndex, anEmptyTableHasNobody) {
    EXPECT_TRUE(PersonIndex(Family()).find("anna").empty());
    EXPECT_TRUE(PersonIndex(Family()).find("1").empty());
}
