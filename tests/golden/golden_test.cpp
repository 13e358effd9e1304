// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Golden layouts. Each case file below this folder becomes one test under its own name: the engine's text
// must be the text of its "#=" lines, byte for byte, and the whole graph and every question to the host must
// be those of the plain layout. A failure shows the two texts record by record and points at the first "#="
// line of the file.

#include <algorithm>
#include <cstddef>
#include <exception>
#include <filesystem>
#include <iostream>
#include <regex>
#include <string>
#include <utility>
#include <vector>

#include <gtest/gtest.h>

#include <support/CaseFile.h>
#include <support/CaseRun.h>
#include <support/GoldenCase.h>
#include <support/plain/PlainLayout.h>

namespace {

namespace fs = std::filesystem;

constexpr std::size_t kFewestCases = 60;
constexpr const char* kExpectedMark = "#=";

fs::path goldenFolder() {
    return fs::path(OLVANE_GOLDEN_FOLDER);
}

std::vector<fs::path> caseFilesIn(const fs::path& folder) {
    std::vector<fs::path> files;
    for (const fs::directory_entry& entry : fs::directory_iterator(folder)) {
        if (entry.path().extension() == ".case") files.push_back(entry.path());
    }
    std::sort(files.begin(), files.end());
    return files;
}

std::vector<fs::path> allCaseFiles() {
    std::vector<fs::path> files = caseFilesIn(goldenFolder() / "family");
    const std::vector<fs::path> pedigrees = caseFilesIn(goldenFolder() / "pedigree");
    files.insert(files.end(), pedigrees.begin(), pedigrees.end());
    return files;
}

// The records of a result text, each with its ";". A text that breaks off leaves a last record without one.
std::vector<std::string> recordsOf(const std::string& text) {
    std::vector<std::string> records;
    std::size_t start = 0;
    while (start < text.size()) {
        const std::size_t end = text.find(';', start);
        const std::size_t next = end == std::string::npos ? text.size() : end + 1;
        records.push_back(text.substr(start, next - start));
        start = next;
    }
    return records;
}

std::string lineAt(const std::vector<std::string>& lines, std::size_t i) {
    return i < lines.size() ? lines[i] : "(none)";
}

// Equal lines once, different ones as a pair: "-" what is expected, "+" what came.
std::string comparisonOf(const std::vector<std::string>& expected, const std::vector<std::string>& actual) {
    std::string report;
    for (std::size_t i = 0; i < std::max(expected.size(), actual.size()); ++i) {
        const std::string wanted = lineAt(expected, i);
        const std::string came = lineAt(actual, i);
        report += wanted == came ? "    " + wanted + "\n" : "  - " + wanted + "\n  + " + came + "\n";
    }
    return report;
}

std::string firstDifference(const std::vector<std::string>& expected,
                            const std::vector<std::string>& actual) {
    std::size_t i = 0;
    while (i < expected.size() && i < actual.size() && expected[i] == actual[i]) ++i;
    return "line " + std::to_string(i + 1) + "\n  plain:  " + lineAt(expected, i) +
           "\n  engine: " + lineAt(actual, i) + "\n";
}

// Counted from 1; 1 where the file has no such line.
int lineOfExpectedText(const std::string& caseText) {
    const std::size_t mark = caseText.find(std::string("\n") + kExpectedMark);
    if (mark == std::string::npos) return 1;
    const auto markAt = caseText.begin() + static_cast<std::ptrdiff_t>(mark);
    return static_cast<int>(std::count(caseText.begin(), markAt, '\n')) + 2;
}

class GoldenCase : public testing::Test {
public:
    explicit GoldenCase(fs::path file) : path(std::move(file)) {}

    void TestBody() override {
        caseText = support::readWhole(path.string());
        if (!support::hasExpectedText(caseText)) {
            fail("the case has no \"#=\" lines: nothing is expected of it");
            return;
        }
        const support::CaseFile request = support::readCase(path.string());
        compareText(request);
        compareWithPlainLayout(request);
        compareWithItsRecording();
    }

private:
    void fail(const std::string& message) {
        ADD_FAILURE_AT(path.c_str(), lineOfExpectedText(caseText)) << path.string() << "\n" << message;
    }

    void compareText(const support::CaseFile& request) {
        const std::string expected = support::expectedText(caseText);
        const std::string actual = support::layoutText(request);
        if (expected == actual) return;
        fail("the text differs (- expected, + engine):\n" +
             comparisonOf(recordsOf(expected), recordsOf(actual)));
    }

    void compareWithPlainLayout(const support::CaseFile& request) {
        const std::vector<std::string> engine = support::runCase(request, true, true);
        const std::vector<std::string> plain = plain::layOut(request, true, true).lines;
        if (engine != plain) fail("engine and plain layout differ at " + firstDifference(plain, engine));
    }

    // Recording a case must change nothing but its records, or a person cannot see what has changed.
    void compareWithItsRecording() {
        if (support::withExpectedText(caseText, support::expectedText(caseText)) == caseText) return;
        fail("the \"#=\" lines must stand right behind the leading comment, one record a line");
    }

    fs::path path;
    std::string caseText;
};

// A test's name has no "-": a filter would take what follows for tests to leave out.
std::string testNameOf(const fs::path& file) {
    std::string name = file.stem().string();
    std::replace(name.begin(), name.end(), '-', '_');
    return name;
}

void registerCase(const fs::path& file) {
    const char* suite = file.parent_path().filename() == "pedigree" ? "GoldenPedigree" : "GoldenFamily";
    const int line = lineOfExpectedText(support::readWhole(file.string()));
    testing::RegisterTest(suite, testNameOf(file).c_str(), nullptr, nullptr, file.c_str(), line,
                          [file]() -> testing::Test* { return new GoldenCase(file); });
}

TEST(GoldenFolder, holdsAtLeastSixtyCases) {
    EXPECT_GE(allCaseFiles().size(), kFewestCases) << goldenFolder();
}

TEST(GoldenFolder, holdsEveryQuirkOfThePage) {
    const std::string page = support::readWhole(OLVANE_QUIRKS_PAGE);
    for (const fs::path& file : allCaseFiles()) {
        const std::string name = file.stem().string();
        if (name.rfind("quirk-", 0) != 0) continue;
        const std::string picture = file.parent_path().filename().string() + "/" + name + ".svg";
        EXPECT_NE(page.find(picture), std::string::npos) << OLVANE_QUIRKS_PAGE << " lacks " << picture;
    }
}

// A quirk that no layout shows names the tests that hold it, as `Suite.test` or `Suite.*`.
TEST(QuirksPage, namesTestsThatThereAre) {
    const std::string page = support::readWhole(OLVANE_QUIRKS_PAGE);
    std::string sources;
    for (const fs::directory_entry& entry : fs::recursive_directory_iterator(OLVANE_UNIT_TESTS)) {
        if (entry.path().extension() == ".cpp") sources += support::readWhole(entry.path().string());
    }
    const std::regex named("`([A-Z][A-Za-z]+)\\.([a-z][A-Za-z0-9]+|\\*)`");
    int count = 0;
    for (std::sregex_iterator it(page.begin(), page.end(), named), end; it != end; ++it, ++count) {
        const std::string test = (*it)[2] == "*" ? "" : (*it)[2].str() + ")";
        EXPECT_NE(sources.find("(" + (*it)[1].str() + ", " + test), std::string::npos) << it->str();
    }
    EXPECT_LT(15, count);
}

}  // namespace

int main(int argc, char** argv) {
    testing::InitGoogleTest(&argc, argv);
    try {
        for (const fs::path& file : allCaseFiles()) registerCase(file);
    } catch (const std::exception& failure) {
        std::cerr << "test_golden: " << failure.what() << "\n";
        return 2;
    }
    return RUN_ALL_TESTS();
}
