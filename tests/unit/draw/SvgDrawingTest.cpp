// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// What stands in a picture, by its text.

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <map>
#include <regex>
#include <string>

#include <olvane/draw/SvgDrawing.h>

namespace olvane::draw {
namespace {

using testing::HasSubstr;
using testing::Not;

PersonLabel label(const std::string& given, const std::string& surname, LabelSex sex = LabelSex::male) {
    PersonLabel result;
    result.given = given;
    result.surname = surname;
    result.sex = sex;
    return result;
}

// A couple with two children and an add-node, drawn with labels that a test may change.
class Picture : public testing::Test {
protected:
    Picture() {
        labels_[1] = label("Karl", "Berg");
        labels_[1].birth = "1801";
        labels_[1].death = "~1870";
        labels_[2] = label("Ada", "Lund", LabelSex::female);
        labels_[3] = label("Olga", "Berg", LabelSex::female);
        labels_[4] = label("Nils", "Berg", LabelSex::other);
        content_.records = readLayoutText(
            "1:0:0:0:55,40,80,40|;-1:0:-110:0:27,-30,27,-15|:M:1;2:80:0:0:67,40,67,95|67,40,67,95|;"
            "3:0:110:0:27,95,67,95|27,110,27,95|;4:80:110:1:107,95,67,95|107,110,107,95|;");
        content_.focusId = 1;
        content_.labelOf = [this](std::int64_t id) { return labels_.at(id); };
    }

    std::string draw() const { return drawSvg(content_, options_).svg; }

    std::map<std::int64_t, PersonLabel> labels_;
    DrawingContent content_;
    DrawingOptions options_;
};

std::size_t countOf(const std::string& text, const std::string& part) {
    std::size_t count = 0;
    for (auto at = text.find(part); at != std::string::npos; at = text.find(part, at + part.size())) ++count;
    return count;
}

TEST_F(Picture, sameContentGivesTheSameBytes) {
    EXPECT_EQ(draw(), draw());
}

TEST_F(Picture, namesAndYearsStandAsText) {
    const std::string svg = draw();
    EXPECT_THAT(svg, HasSubstr(">Karl</text>"));
    EXPECT_THAT(svg, HasSubstr(">Berg</text>"));
    EXPECT_THAT(svg, HasSubstr(">* 1801  † ~1870</text>"));
}

TEST_F(Picture, everyBoxHasATitleForScreenReaders) {
    const std::string svg = draw();
    EXPECT_EQ(countOf(svg, "<g role=\"img\""), 5u);
    EXPECT_THAT(svg, HasSubstr("<title>Karl Berg, * 1801, † ~1870 (focus of this picture)</title>"));
    EXPECT_THAT(svg, HasSubstr("<title>Family tree</title>"));
}

TEST_F(Picture, addNodeInvitesInADashedBox) {
    const std::string svg = draw();
    EXPECT_THAT(svg, HasSubstr(">add father</text>"));
    EXPECT_THAT(svg, HasSubstr("<title>add father of Karl Berg</title>"));
    EXPECT_EQ(countOf(svg, "stroke-dasharray=\"5 4\""), 1u);
}

TEST_F(Picture, focusAloneHasTheFocusColour) {
    EXPECT_EQ(countOf(draw(), std::string(lightTheme().focus)), 2u);  // its two borders
}

TEST_F(Picture, onlyAFlaggedPersonCarriesTheMark) {
    EXPECT_EQ(countOf(draw(), "Has relatives who are not shown"), 2u);  // in the box's title and the mark's
}

TEST_F(Picture, markCountsWhatIsNotShown) {
    labels_[4].hidden = HiddenRelatives{2, 1, 3};
    const std::string svg = draw();
    EXPECT_THAT(svg, HasSubstr(">+6</text>"));
    EXPECT_THAT(svg, HasSubstr("Not shown: 2 parents, 1 spouse, 3 children"));
}

TEST_F(Picture, sexIsToldByTheSilhouetteToo) {
    const std::string svg = draw();
    EXPECT_EQ(countOf(svg, "href=\"#olvane-man\""), 1u);
    EXPECT_EQ(countOf(svg, "href=\"#olvane-woman\""), 2u);
    EXPECT_EQ(countOf(svg, "href=\"#olvane-person\""), 1u);
}

TEST_F(Picture, repeatedSegmentsAreDrawnOnce) {
    EXPECT_EQ(countOf(draw(), "M162 "), 1u);  // the drop at x 67: (67 - 0) * 2 + 28
}

TEST_F(Picture, linesComeBeforeBoxesAndBoxesAreOpaque) {
    const std::string svg = draw();
    EXPECT_LT(svg.find(lightTheme().line), svg.find("<g role=\"img\""));
    EXPECT_THAT(svg, Not(HasSubstr("opacity")));
}

TEST_F(Picture, markupInNamesStaysText) {
    labels_[1].given = "<script>alert('x')</script>";
    labels_[1].surname = "\"/><a href=\"javascript:x\">&amp;";
    labels_[1].birth = "<!--";
    options_.title = "</title><script>x</script>";
    options_.headline = true;
    const std::string svg = draw();
    EXPECT_THAT(svg, Not(HasSubstr("<script")));
    EXPECT_THAT(svg, Not(HasSubstr("<a ")));
    EXPECT_THAT(svg, Not(HasSubstr("<!--")));
    EXPECT_THAT(svg, HasSubstr("&lt;script&gt;"));
    EXPECT_THAT(svg, HasSubstr("&amp;amp;"));
}

TEST_F(Picture, livingPersonLeavesNoTrace) {
    labels_[2].birth = "1990";
    labels_[2].living = true;
    labels_[2].hidden = HiddenRelatives{0, 0, 7};
    const std::string svg = draw();
    EXPECT_THAT(svg, HasSubstr(">Living</text>"));
    EXPECT_THAT(svg, HasSubstr("<title>Living</title>"));
    for (const char* trace : {"Ada", "Lund", "1990"}) EXPECT_THAT(svg, Not(HasSubstr(trace)));
}

TEST_F(Picture, placeholderOfALivingPersonDoesNotNameThem) {
    labels_[1].living = true;
    const std::string svg = draw();
    EXPECT_THAT(svg, HasSubstr("<title>add father of Living</title>"));
    EXPECT_THAT(svg, Not(HasSubstr("Karl")));
}

TEST_F(Picture, personInSeveralBoxesCarriesANumberInEach) {
    content_.records.push_back(content_.records[3]);
    content_.records.back().x = 400;
    const std::string svg = draw();
    EXPECT_EQ(countOf(svg, ">=1</text>"), 2u);
    EXPECT_THAT(svg, HasSubstr("Stands in 2 boxes, all marked 1"));
}

TEST_F(Picture, secondBoxOfTheFocusIsNotDrawnAsFocus) {
    content_.records.push_back(content_.records[0]);
    content_.records.back().x = 400;
    EXPECT_EQ(countOf(draw(), std::string(lightTheme().focus)), 2u);
}

TEST_F(Picture, legendAppearsOnlyWhenAStyleIsUsed) {
    EXPECT_THAT(draw(), Not(HasSubstr("Legend")));
    content_.isDivorced = [](std::int64_t, std::int64_t) { return true; };
    EXPECT_THAT(draw(), HasSubstr(">divorced</text>"));
    EXPECT_THAT(draw(), Not(HasSubstr("adopted")));
}

TEST_F(Picture, adoptedAndFosterChildrenHaveLinesOfTheirOwn) {
    content_.parentLinkOf = [](std::int64_t id) {
        return id == 3 ? ParentLink::adopted : ParentLink::foster;
    };
    const std::string svg = draw();
    EXPECT_THAT(svg, HasSubstr(">adopted child</text>"));
    EXPECT_THAT(svg, HasSubstr(">foster child</text>"));
    EXPECT_EQ(countOf(svg, "stroke-dasharray=\"2 4\""), 2u);  // the line and the legend
}

TEST_F(Picture, styledChildrenShareAPlainTrunk) {
    // Both children are on the left; the near one's way along the trunk serves the far one too.
    content_.records = readLayoutText(
        "1:200:0:0:227,80,227,95|;3:0:110:0:27,95,227,95|27,110,27,95|;4:80:110:0:107,95,227,95|107,110,107,"
        "95|;");
    content_.parentLinkOf = [](std::int64_t id) {
        return id == 3 ? ParentLink::adopted : ParentLink::foster;
    };
    const std::string svg = draw();
    EXPECT_THAT(svg, HasSubstr("M242 218H482"));      // plain, from the near child to the joint
    EXPECT_THAT(svg, HasSubstr("M242 218H82V248"));   // the far child's own
    EXPECT_THAT(svg, HasSubstr("M242 218H242V248"));  // the near child's own
}

TEST_F(Picture, nameNotKnownIsAQuestionMark) {
    labels_[2] = PersonLabel();
    const std::string svg = draw();
    EXPECT_THAT(svg, HasSubstr(">?</text>"));
    EXPECT_THAT(svg, HasSubstr("<title>Name not known</title>"));
}

TEST_F(Picture, surnameStandsFirstWhereItIsWrittenSo) {
    labels_[1] = label("泽东", "毛");
    labels_[1].surnameFirst = true;
    const std::string svg = draw();
    EXPECT_LT(svg.find(">毛</text>"), svg.find(">泽东</text>"));
    EXPECT_THAT(svg, HasSubstr("<title>毛 泽东"));
}

TEST_F(Picture, rightToLeftNamesSayTheirDirection) {
    labels_[1].given = "שרה";
    EXPECT_THAT(draw(), HasSubstr("direction=\"rtl\">שרה</text>"));
}

TEST_F(Picture, headlineIsDrawnWhenAskedFor) {
    options_.title = "The Bergs";
    EXPECT_THAT(draw(), Not(HasSubstr(">The Bergs</text>")));
    options_.headline = true;
    EXPECT_THAT(draw(), HasSubstr(">The Bergs</text>"));
}

TEST_F(Picture, pageTakesAllBoxes) {
    const SvgPicture picture = drawSvg(content_, options_);
    EXPECT_EQ(picture.width, 135 * 2 + 56);
    EXPECT_EQ(picture.height, 300 * 2 + 56);
}

TEST_F(Picture, boxesTellWhereTheyAreInPictureAndText) {
    const SvgPicture picture = drawSvg(content_, options_);
    ASSERT_EQ(picture.boxes.size(), 5u);
    const PictureBox& focus = picture.boxes[0];
    EXPECT_EQ(focus.area.x, 28);
    EXPECT_EQ(focus.area.width, 110);
    const std::string text = picture.svg.substr(focus.start, focus.length);
    EXPECT_TRUE(text.starts_with("<g role=\"img\""));
    EXPECT_TRUE(text.ends_with("</g>\n"));
    EXPECT_THAT(text, HasSubstr(">Karl</text>"));
}

TEST_F(Picture, strokesTellTheirBytesOfThePaths) {
    const SvgPicture picture = drawSvg(content_, options_);
    ASSERT_FALSE(picture.strokes.empty());
    for (const PictureBox& stroke : picture.strokes) {
        const std::string text = picture.svg.substr(stroke.start, stroke.length);
        EXPECT_EQ(text.find_first_not_of("MHV0123456789. "), std::string::npos) << text;
        EXPECT_EQ(text.rfind('M'), 0u) << text;
        const char behind = picture.svg[stroke.start + stroke.length];
        EXPECT_TRUE(behind == 'M' || behind == '"') << behind;
        EXPECT_LT(stroke.start, picture.boxes.front().start);
    }
}

TEST_F(Picture, emptyLayoutIsAPageThatSaysSo) {
    content_.records.clear();
    EXPECT_THAT(draw(), HasSubstr(">Nobody to show</text>"));
}

TEST_F(Picture, numbersArePlain) {
    EXPECT_FALSE(std::regex_search(draw(), std::regex("(nan|inf|e[-+][0-9])\"")));
}

TEST_F(Picture, crossingOfTwoFamiliesLeavesAGap) {
    // A second family's drop comes down through the first one's trunk.
    content_.records = readLayoutText(
        "1:0:0:0:27,80,27,87|;2:80:0:0:107,80,107,95|;3:160:110:0:187,87,27,87|187,110,187,87|;"
        "4:80:110:0:107,95,107,95|107,110,107,95|;");
    EXPECT_EQ(countOf(draw(), "stroke=\"" + std::string(lightTheme().page) + "\" stroke-width=\"8\""), 1u);
}

}  // namespace
}  // namespace olvane::draw
