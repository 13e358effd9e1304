// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// What stands in a picture, by its text.

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <map>
#include <regex>
#include <stdexcept>
#include <string>
#include <utility>
#include <vector>

#include <olvane/draw/SvgDrawing.h>
#include <olvane/picture/LineRouter.h>

namespace olvane::draw {
namespace {

using testing::HasSubstr;
using testing::Not;

kin::PersonLabel label(const std::string& given, const std::string& surname, kin::Sex sex = kin::Sex::male) {
    kin::PersonLabel result;
    result.given = given;
    result.surname = surname;
    result.sex = sex;
    return result;
}

// A couple with two children and an unknown parent, drawn with labels that a test may change.
class Picture : public testing::Test {
protected:
    Picture() {
        labels_[1] = label("Karl", "Berg");
        labels_[1].birth = "1801";
        labels_[1].death = "~1870";
        labels_[2] = label("Ada", "Lund", kin::Sex::female);
        labels_[3] = label("Olga", "Berg", kin::Sex::female);
        labels_[4] = label("Nils", "Berg", kin::Sex::unknown);
        addBox(1, 0, 0);
        addBox(0, 0, -110);
        addBox(2, 80, 0);
        addBox(3, 0, 110);
        addBox(4, 80, 110);
        boxOf(0).kind = picture::BoxKind::unknownParent;
        boxOf(0).sex = kin::Sex::male;
        boxOf(0).childOf = 0;
        boxOf(4).flag = true;
        addFamily({0, 2}, {3, 4});
        addFamily({1}, {0});
        content_.picture.focus = 0;
        picture::routeLines(content_.picture);
        content_.labelOf = [this](std::int64_t id) { return labels_.at(id); };
    }

    picture::Box& boxOf(std::int64_t id) {
        for (picture::Box& box : content_.picture.boxes) {
            if (box.id == id) return box;
        }
        throw std::out_of_range("no box");
    }

    void addBox(std::int64_t id, double x, double y) {
        picture::Box box;
        box.id = id;
        box.x = x;
        box.y = y;
        box.width = 55;
        box.height = 80;
        box.hasFlag = true;
        content_.picture.boxes.push_back(box);
    }

    // Members by their places in boxes.
    void addFamily(const std::vector<picture::Index>& parents, const std::vector<picture::Index>& children) {
        picture::Picture& picture = content_.picture;
        picture::Family family;
        family.firstMember = static_cast<std::uint32_t>(picture.members.size());
        family.parentCount = static_cast<std::uint8_t>(parents.size());
        family.childCount = static_cast<std::uint32_t>(children.size());
        family.number = static_cast<std::uint32_t>(picture.families.size()) + 1;
        picture.members.insert(picture.members.end(), parents.begin(), parents.end());
        picture.members.insert(picture.members.end(), children.begin(), children.end());
        picture.childKinds.resize(picture.members.size());
        picture.families.push_back(family);
    }

    // A second box of a person, with the mark for both.
    void repeat(std::int64_t id, picture::Index first) {
        addBox(id, 400, 0);
        const auto second = static_cast<picture::Index>(content_.picture.boxes.size()) - 1;
        content_.picture.marks.push_back({{first, second, picture::kNone}, 1, picture::MarkKind::samePerson});
    }

    // Of the children of the couple.
    void setKinds(kin::ChildKind first, kin::ChildKind second) {
        content_.picture.childKinds[2] = first;
        content_.picture.childKinds[3] = second;
    }

    std::string draw() const { return drawSvg(content_, options_).svg; }

    std::map<std::int64_t, kin::PersonLabel> labels_;
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

TEST_F(Picture, unknownParentInvitesInADashedBox) {
    const std::string svg = draw();
    EXPECT_THAT(svg, HasSubstr(">add father</text>"));
    EXPECT_THAT(svg, HasSubstr("<title>add father of Karl Berg</title>"));
    EXPECT_EQ(countOf(svg, "stroke-dasharray=\"5 4\""), 1u);
}

TEST_F(Picture, photographTakesThePlaceOfTheSilhouetteAndIsCutToIt) {
    content_.photoOf = [](std::int64_t id) { return id == 2 ? "a.png?b&c\"d" : ""; };
    const std::string svg = draw();
    EXPECT_EQ(countOf(svg, "<use href=\"#olvane-"), 3u);
    EXPECT_EQ(countOf(svg, "<image href=\"a.png?b&amp;c&quot;d\" "), 1u);
    EXPECT_EQ(countOf(svg, "preserveAspectRatio=\"xMidYMid slice\"/>"), 1u);
}

TEST_F(Picture, photographStaysWhereNamesAreWantedLarge) {
    content_.photoOf = [](std::int64_t id) { return id == 2 ? "a.png" : ""; };
    DrawingOptions options;
    options.leastNameSize = 20;
    const std::string svg = drawSvg(content_, options).svg;
    EXPECT_EQ(countOf(svg, "<image "), 1u);
    EXPECT_EQ(countOf(svg, "<use href=\"#olvane-"), 3u);
}

TEST_F(Picture, nobodyIsAskedForThePhotographOfSomebodyWhoIsHidden) {
    labels_[2].living = true;
    content_.photoOf = [](std::int64_t id) { return id == 2 ? "secret.png" : ""; };
    EXPECT_THAT(draw(), Not(HasSubstr("secret")));
}

TEST_F(Picture, focusAloneHasTheFocusColour) {
    EXPECT_EQ(countOf(draw(), std::string(lightTheme().focus)), 2u);  // its two borders
}

TEST_F(Picture, onlyAFlaggedPersonCarriesTheMark) {
    EXPECT_EQ(countOf(draw(), "Has relatives who are not shown"), 2u);  // in the box's title and the mark's
}

TEST_F(Picture, markCountsWhatIsNotShown) {
    content_.countsHidden = true;
    boxOf(4).hiddenParents = 2;
    boxOf(4).hiddenPartners = 1;
    boxOf(4).hiddenChildren = 3;
    const std::string svg = draw();
    EXPECT_THAT(svg, HasSubstr(">+6</text>"));
    EXPECT_THAT(svg, HasSubstr("Not shown: 2 parents, 1 spouse, 3 children"));
}

// Two ways between the children: one over the father, one over both parents' line.
class PictureOfKinship : public Picture {
protected:
    PictureOfKinship() {
        picture::Picture& picture = content_.picture;
        picture.focus = 3;
        picture.other = 4;
        picture.focusIs = "half sister";
        picture.otherIs = "brother, the one and only of all of them";
        picture.wayBoxes = {3, 0, 4, 0, 3, 2, 4};
        picture.wayPieces = {{10, 20, 10, 60}, {10, 60, 40, 60}, {12, 22, 12, 62}};
        picture.ways = {{0, 3, 1, 0, 2, picture::WayKind::blood, "by the father"},
                        {4, 3, 0, 2, 1, picture::WayKind::marriage, "by <both>"}};
    }
};

TEST_F(PictureOfKinship, hasALineOfItsOwnColourAndDashesForEachWayAndALegendOfThem) {
    const std::string svg = draw();
    // Boxes begin at (0, -110); two px for each point, behind a margin of 28.
    EXPECT_THAT(svg, HasSubstr("<g><title>by the father</title><path fill=\"none\" stroke=\"#0060a8\" "
                               "stroke-width=\"3.4\" stroke-linecap=\"square\" "
                               "d=\"M48 288L48 368M48 368L108 368\"/>"));
    EXPECT_THAT(svg, HasSubstr("<title>by &lt;both&gt;</title><path fill=\"none\" stroke=\"#b3470f\" "
                               "stroke-width=\"3.4\" stroke-dasharray=\"9 4\""));
    EXPECT_THAT(svg, HasSubstr(">by the father</text>"));
    EXPECT_THAT(svg, HasSubstr(">by &lt;both&gt;</text>"));
    EXPECT_EQ(countOf(svg, "stroke=\"#0060a8\""), 2u);  // in the picture and in its legend
}

TEST_F(PictureOfKinship, printsWaysApartByTheirDashes) {
    options_.theme = &printTheme();
    EXPECT_THAT(draw(), HasSubstr("stroke-dasharray=\"9 4\""));
}

TEST_F(PictureOfKinship, setsOffBothEndsAndTheCommonAncestor) {
    const std::string svg = draw();
    EXPECT_THAT(svg, HasSubstr("(focus of this picture). half sister"));
    EXPECT_THAT(svg, HasSubstr(">half sister</text>"));
    EXPECT_THAT(svg, HasSubstr("Nils Berg. brother, the one and only of all of them"));
    EXPECT_THAT(svg, testing::ContainsRegex(">brother, [a-z ]+</text>"));
    EXPECT_THAT(svg, HasSubstr(" of them</text>"));
    EXPECT_EQ(countOf(svg, ". Common ancestor</title>"), 1u);
    EXPECT_THAT(svg, HasSubstr("Karl Berg, * 1801, † ~1870. Common ancestor"));
    EXPECT_EQ(countOf(svg, "stroke=\"" + std::string(lightTheme().focus) + "\" stroke-width=\"4\""), 2u);
}

TEST_F(PictureOfKinship, legendExplainsTheFrameOfACommonAncestorWhereItIsDrawn) {
    EXPECT_EQ(countOf(draw(), ">Common ancestor</text>"), 1u);
    content_.picture.focus = 0;  // whose frame is that of an end
    EXPECT_EQ(countOf(draw(), ">Common ancestor</text>"), 0u);
}

// A caption would lie over a line that leaves the box downwards.
TEST_F(PictureOfKinship, writesAboveABoxWithALineBelow) {
    picture::Box& father = boxOf(0);
    father.id = 5;
    father.kind = picture::BoxKind::person;
    labels_[5] = label("Ole", "Berg");
    content_.picture.focus = 1;
    const std::string svg = draw();
    const std::size_t caption = svg.find(">half sister</text>");
    const std::size_t y = svg.rfind(" y=\"", caption) + 4;
    EXPECT_LT(std::stod(svg.substr(y)), 4);
}

TEST_F(Picture, sexShowsInTheSilhouetteToo) {
    const std::string svg = draw();
    EXPECT_EQ(countOf(svg, "href=\"#olvane-man\""), 1u);
    EXPECT_EQ(countOf(svg, "href=\"#olvane-woman\""), 2u);
    EXPECT_EQ(countOf(svg, "href=\"#olvane-person\""), 1u);
}

TEST_F(Picture, eachFamilyIsAnElementOfItsOwn) {
    const SvgPicture drawn = drawSvg(content_, options_);
    ASSERT_EQ(drawn.strokes.size(), 2u);
    for (const PictureBox& stroke : drawn.strokes) {
        const std::string text = drawn.svg.substr(stroke.start, stroke.length);
        EXPECT_TRUE(text.starts_with("<g><path")) << text;
        EXPECT_TRUE(text.ends_with("</g>\n")) << text;
        EXPECT_LT(stroke.start, drawn.boxes.front().start);
    }
    EXPECT_THAT(drawn.svg.substr(drawn.strokes[0].start, drawn.strokes[0].length), HasSubstr("M138 328H188"))
        << "the marriage line, from 55 to 80 at y 40: (x - 0) * 2 + 28, (y + 110) * 2 + 28";
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

TEST_F(Picture, aNameOfAnyLengthIsCut) {
    std::string name;
    for (int i = 0; i < 400000; ++i) name += "\xC3\xA9";
    labels_[1] = label(name, name);
    options_.title = name;
    options_.headline = true;
    const std::string svg = draw();
    EXPECT_LT(svg.size(), 100000u);
    EXPECT_THAT(svg, Not(HasSubstr("\xEF\xBF\xBD"))) << "cut between two characters";
}

TEST_F(Picture, livingPersonLeavesNoTrace) {
    labels_[2].birth = "1990";
    labels_[2].living = true;
    content_.countsHidden = true;
    boxOf(2).flag = true;
    boxOf(2).hiddenChildren = 7;
    const std::string svg = draw();
    EXPECT_THAT(svg, HasSubstr(">Living</text>"));
    EXPECT_THAT(svg, HasSubstr("<title>Living. Has relatives who are not shown</title>"));
    for (const char* trace : {"Ada", "Lund", "1990", "+7", "7 children"})
        EXPECT_THAT(svg, Not(HasSubstr(trace)));
}

TEST_F(Picture, unknownParentOfALivingPersonDoesNotNameThem) {
    labels_[1].living = true;
    const std::string svg = draw();
    EXPECT_THAT(svg, HasSubstr("<title>add father of Living</title>"));
    EXPECT_THAT(svg, Not(HasSubstr("Karl")));
}

TEST_F(Picture, personInSeveralBoxesCarriesANumberInEach) {
    repeat(3, 3);
    const std::string svg = draw();
    EXPECT_EQ(countOf(svg, ">=1</text>"), 2u);
    EXPECT_THAT(svg, HasSubstr("Stands in 2 boxes, all marked 1"));
}

TEST_F(Picture, secondBoxOfTheFocusIsNotDrawnAsFocus) {
    repeat(1, 0);
    EXPECT_EQ(countOf(draw(), std::string(lightTheme().focus)), 2u);
}

TEST_F(Picture, legendAppearsOnlyWhenAStyleIsUsed) {
    boxOf(4).flag = false;
    EXPECT_THAT(draw(), Not(HasSubstr("Legend")));
    content_.picture.families[0].style = kin::UnionState::divorced;
    EXPECT_THAT(draw(), HasSubstr(">divorced</text>"));
    EXPECT_THAT(draw(), Not(HasSubstr("adopted")));
}

// On paper no title shows what a sign means.
TEST_F(Picture, legendStatesWhatTheSignsAtBoxesMean) {
    const auto rowsOf = [](const std::string& svg) { return svg.substr(svg.find("<title>Legend</title>")); };
    EXPECT_THAT(rowsOf(draw()), HasSubstr(">relatives not drawn here</text>"));
    EXPECT_THAT(rowsOf(draw()), Not(HasSubstr("further parents")));
    EXPECT_THAT(rowsOf(draw()), Not(HasSubstr("same number")));
    boxOf(2).furtherParents = 1;
    content_.picture.marks.push_back({{4, 2, picture::kNone}, 7, picture::MarkKind::parentsElsewhere});
    content_.picture.folded = {{0, 12, picture::Branch::up, picture::Side::top}};
    const std::string rows = rowsOf(draw());
    EXPECT_THAT(rows, HasSubstr(">further parents</text>"));
    EXPECT_THAT(rows, HasSubstr(">goes on at the same number</text>"));
    EXPECT_THAT(rows, HasSubstr(">folded branch</text>"));
    EXPECT_THAT(rows, HasSubstr(">+12</text>"));
    EXPECT_THAT(rows, Not(HasSubstr("several boxes")));
    repeat(1, 0);
    EXPECT_THAT(rowsOf(draw()), HasSubstr(">person with several boxes</text>"));
}

// The boxes of this picture fill both lower corners, until one is moved up.
TEST_F(Picture, legendStandsInAFreeCornerAndElseBelow) {
    boxOf(4).flag = false;
    const int height = drawSvg(content_, options_).height;
    boxOf(4).flag = true;
    const SvgPicture below = drawSvg(content_, options_);
    EXPECT_GT(below.height, height);
    addBox(9, 300, 0);
    labels_[9] = label("Ole", "Berg");
    const SvgPicture inside = drawSvg(content_, options_);
    EXPECT_EQ(inside.height, height);
    for (const PictureBox& box : inside.boxes) {
        const bool isApart = box.area.x + box.area.width < inside.legend.x ||
                             inside.legend.x + inside.legend.width < box.area.x ||
                             box.area.y + box.area.height < inside.legend.y;
        EXPECT_TRUE(isApart) << inside.legend.x << ' ' << inside.legend.y;
    }
}

TEST_F(Picture, furtherParentsOfTheLivingAreNotInTheLegend) {
    boxOf(2).furtherParents = 1;
    labels_[2].living = true;
    EXPECT_THAT(draw(), Not(HasSubstr("further parents")));
}

TEST_F(Picture, adoptedAndFosterChildrenHaveLinesOfTheirOwn) {
    setKinds(kin::ChildKind::adopted, kin::ChildKind::foster);
    const std::string svg = draw();
    EXPECT_THAT(svg, HasSubstr(">adopted child</text>"));
    EXPECT_THAT(svg, HasSubstr(">foster child</text>"));
    EXPECT_EQ(countOf(svg, "stroke-dasharray=\"2 4\""), 2u);  // the line and the legend
}

TEST_F(Picture, everyKindAndStateHasDashesOfItsOwn) {
    setKinds(kin::ChildKind::step, kin::ChildKind::sealing);
    content_.picture.families[0].style = kin::UnionState::unmarried;
    const std::string svg = draw();
    for (const char* meaning : {"step child", "sealed child", "not married"}) {
        EXPECT_THAT(svg, HasSubstr(">" + std::string(meaning) + "</text>"));
    }
}

TEST_F(Picture, aLabelStandsAtTheMarriageLine) {
    EXPECT_THAT(draw(), Not(HasSubstr(">1839</text>")));
    content_.familyLabelOf = [](std::uint32_t family) { return family == 1 ? "1839" : ""; };
    EXPECT_EQ(countOf(draw(), ">1839</text>"), 1u);
}

TEST_F(Picture, detailsStandBelowTheYears) {
    labels_[1].details = {"* Uppsala", "\xE2\x80\xA0 Bergen", "smith"};
    const std::string svg = draw();
    EXPECT_LT(svg.find("* 1801"), svg.find(">* Uppsala</text>"));
    EXPECT_LT(svg.find(">* Uppsala</text>"), svg.find(">smith</text>"));
    labels_[1].living = true;
    EXPECT_THAT(draw(), Not(HasSubstr("Uppsala")));
}

// The child of the second family is drawn elsewhere: the same number at it and at its parent.
TEST_F(Picture, whatIsElsewhereHasANumberAtBothEnds) {
    content_.picture.marks.push_back({{4, 2, picture::kNone}, 7, picture::MarkKind::parentsElsewhere});
    content_.picture.marks.push_back({{0, 3, picture::kNone}, 8, picture::MarkKind::partnersElsewhere});
    const std::string svg = draw();
    EXPECT_EQ(countOf(svg,
                      ">\xE2\x86\x91"
                      "7</text>"),
              1u);
    EXPECT_EQ(countOf(svg,
                      ">\xE2\x86\x93"
                      "7</text>"),
              1u);
    EXPECT_EQ(countOf(svg,
                      ">\xE2\x86\x94"
                      "8</text>"),
              3u);  // at both partners and in the legend
}

// Of a child and of its parent, and of two partners, in a chart whose children stand on that side.
struct Arrows {
    picture::Side laterSide;
    const char* toParents;
    const char* toChildren;
    const char* toPartners;
};

TEST_F(Picture, arrowsOfMarksLeadToWhereTheGenerationsStand) {
    content_.picture.marks.push_back({{4, 2, picture::kNone}, 7, picture::MarkKind::parentsElsewhere});
    content_.picture.marks.push_back({{0, 3, picture::kNone}, 8, picture::MarkKind::partnersElsewhere});
    const std::vector<Arrows> sides{
        {picture::Side::bottom, "\xE2\x86\x91", "\xE2\x86\x93", "\xE2\x86\x94"},
        {picture::Side::top, "\xE2\x86\x93", "\xE2\x86\x91", "\xE2\x86\x94"},
        {picture::Side::right, "\xE2\x86\x90", "\xE2\x86\x92", "\xE2\x86\x95"},
        {picture::Side::left, "\xE2\x86\x92", "\xE2\x86\x90", "\xE2\x86\x95"},
    };
    for (const Arrows& arrows : sides) {
        content_.laterSide = arrows.laterSide;
        SvgPicture drawn = drawSvg(content_, DrawingOptions());
        const auto boxText = [&drawn](std::size_t box) {
            return drawn.svg.substr(drawn.boxes[box].start, drawn.boxes[box].length);
        };
        const auto sign = [](const char* arrow, const char* number) {
            return std::string(">") + arrow + number + "</text>";
        };
        EXPECT_THAT(boxText(4), HasSubstr(sign(arrows.toParents, "7")));
        EXPECT_THAT(boxText(2), HasSubstr(sign(arrows.toChildren, "7")));
        EXPECT_THAT(boxText(0), HasSubstr(sign(arrows.toPartners, "8")));
        EXPECT_THAT(boxText(3), HasSubstr(sign(arrows.toPartners, "8")));
        // The mark for children stands on the edge from which lines to children run.
        const bool isOnTop = boxText(2).find("y=\"-") < boxText(2).find(sign(arrows.toChildren, "7"));
        EXPECT_EQ(isOnTop, arrows.laterSide == picture::Side::top);
    }
}

// Two children of one couple are elsewhere: the mark at their parent stands once.
TEST_F(Picture, aMarkOfSeveralChildrenStandsOnceAtTheirParent) {
    for (const picture::Index child : {3, 4}) {
        content_.picture.marks.push_back(
            {{child, 2, picture::kNone}, 7, picture::MarkKind::parentsElsewhere});
    }
    const std::string svg = draw();
    EXPECT_EQ(countOf(svg,
                      ">\xE2\x86\x91"
                      "7</text>"),
              2u);
    EXPECT_EQ(countOf(svg,
                      ">\xE2\x86\x93"
                      "7</text>"),
              2u);  // at the parent and in the legend
}

TEST_F(Picture, manyMarksOfOneBoxAreCounted) {
    for (int i = 1; i <= 9; ++i) {
        content_.picture.marks.push_back({{4, 2, picture::kNone}, i, picture::MarkKind::parentsElsewhere});
    }
    const std::string svg = draw();
    EXPECT_THAT(svg, HasSubstr(">\xE2\x86\x91"
                               "2</text>"));
    EXPECT_THAT(svg, Not(HasSubstr(">\xE2\x86\x91"
                                   "3</text>")));
    EXPECT_EQ(countOf(svg, ">+7</text>"), 2u) << "at the child and at the parent";
}

TEST_F(Picture, nameNotKnownStandsInTheBox) {
    labels_[2] = kin::PersonLabel();
    const std::string svg = draw();
    EXPECT_THAT(svg, HasSubstr(">Name not</text>"));
    EXPECT_THAT(svg, HasSubstr("<title>Name not known</title>"));
}

// A date of which no more than its first word has room says nothing.
TEST_F(Picture, aDateWithoutRoomInItsBoxIsInFewerLetters) {
    labels_[2] = label("Ada", "Lund");
    labels_[2].birth = "between 3 Apr 1869 and 7 Jun 1871";
    labels_[2].shortBirth = "1869-1871";
    labels_[2].death = "2 May 1890";
    labels_[2].shortDeath = "1890";
    const std::string svg = draw();
    EXPECT_THAT(svg, HasSubstr(">* 1869-1871</text>"));
    EXPECT_THAT(svg, HasSubstr(">\xE2\x80\xA0 2 May 1890</text>"));
    EXPECT_THAT(svg, HasSubstr("* between 3 Apr 1869 and 7 Jun 1871"));
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

TEST_F(Picture, longHeadlineWidensASmallPictureRoundItsMiddle) {
    const SvgPicture narrow = drawSvg(content_, DrawingOptions());
    DrawingOptions options;
    options.headline = true;
    options.title = "The descendants of Karl Berg and Ada Lund";
    const SvgPicture wide = drawSvg(content_, options);
    EXPECT_THAT(wide.svg, HasSubstr(">" + options.title + "</text>"));
    EXPECT_GT(wide.width, narrow.width);
    EXPECT_EQ(wide.originX - narrow.originX, (wide.width - narrow.width) / 2);
    options.title += options.title + options.title + options.title;
    EXPECT_EQ(drawSvg(content_, options).width, 600 + 2 * 28);
}

TEST_F(Picture, headlineIsDrawnWhenAskedFor) {
    options_.title = "The Bergs";
    EXPECT_THAT(draw(), Not(HasSubstr(">The Bergs</text>")));
    options_.headline = true;
    EXPECT_THAT(draw(), HasSubstr(">The Bergs</text>"));
}

TEST_F(Picture, pageTakesAllBoxes) {
    boxOf(4).flag = false;
    const SvgPicture picture = drawSvg(content_, options_);
    EXPECT_EQ(picture.width, 135 * 2 + 56);
    EXPECT_EQ(picture.height, 300 * 2 + 56);
}

TEST_F(Picture, boxesStateWhereTheyAreInPictureAndText) {
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

TEST_F(Picture, emptyLayoutIsAPageThatSaysSo) {
    content_.picture = picture::Picture();
    EXPECT_THAT(draw(), HasSubstr(">Nobody to show</text>"));
}

TEST_F(Picture, numbersArePlain) {
    EXPECT_FALSE(std::regex_search(draw(), std::regex("(nan|inf|e[-+][0-9])\"")));
}

// A parent at the left whose child is at the right, and the other way round.
TEST_F(Picture, aLineThatCrossesAnotherFamilyJumpsOverIt) {
    content_.picture = picture::Picture();
    addBox(1, 0, 0);
    addBox(2, 200, 0);
    addBox(3, 200, 110);
    addBox(4, 0, 110);
    addFamily({0}, {2});
    addFamily({1}, {3});
    picture::routeLines(content_.picture);
    EXPECT_EQ(countOf(draw(), "a4 4 0 0 1 4 -4a4 4 0 0 1 4 4H"), 1u);
}

// Two rings around the focus; the outer cells belong to the lines of the inner ones.
class Fan : public Picture {
protected:
    Fan() {
        content_.picture = picture::Picture();
        const std::pair<double, double> cells[] = {{0, 360}, {-90, 0}, {0, 90}, {-90, -45}};
        for (std::int64_t id = 1; id <= 4; ++id) {
            addBox(id, 0, 0);
            const auto& [from, to] = cells[id - 1];
            content_.picture.arcs.push_back({id == 1   ? 0
                                             : id == 4 ? 2
                                                       : 1,
                                             from, to, id == 4 ? 1 : picture::kNone});
        }
        content_.picture.ringRadii = {0, 40, 95, 150};
        for (picture::Box& box : content_.picture.boxes) {
            box.x = -150;
            box.y = -150;
            box.width = 300;
            box.height = 300;
        }
        content_.picture.focus = 0;
    }
};

// An arc of a whole turn ends where it begins, and of that nothing would be drawn.
TEST_F(Fan, aCellAllTheWayRoundIsDrawnInTwoHalves) {
    content_.picture.boxes.resize(2);
    content_.picture.arcs.resize(2);
    content_.picture.arcs[1].from = 0;
    content_.picture.arcs[1].to = 360;
    const std::string svg = draw();
    EXPECT_EQ(countOf(svg, "A190 190 0 0 1 "), 2u);  // in px
    EXPECT_EQ(countOf(svg, "A80 80 0 0 "), 4u);      // of the middle, and of the cell around it
}

TEST_F(Fan, eachBoxIsACellWithItsName) {
    const SvgPicture drawn = drawSvg(content_, options_);
    ASSERT_EQ(drawn.boxes.size(), 4u);
    for (const char* name : {">Karl</text>", ">Ada</text>", ">Olga</text>"})
        EXPECT_THAT(drawn.svg, HasSubstr(name));
    EXPECT_EQ(countOf(drawn.svg, "(focus of this picture)"), 1u);
    EXPECT_THAT(drawn.svg, Not(HasSubstr("textPath"))) << "some renderers have none";
}

TEST_F(Fan, linesOfDescentHaveColoursThatTheLegendNames) {
    const std::string svg = draw();
    EXPECT_THAT(svg, HasSubstr("<title>Legend</title>"));
    EXPECT_THAT(svg, HasSubstr(">Ada Lund</text>"));
    EXPECT_EQ(countOf(svg, "fill=\"#dbe9f6\""), 3u) << "two cells and the legend";
}

TEST_F(Fan, aNameThatHasNoRoomIsShortenedOrLeftToTheTitle) {
    content_.picture.arcs[3].to = -89;
    labels_[4] = label("Maximilian Alexander Theodor", "von und zu Hohenberg");
    const std::string svg = draw();
    EXPECT_THAT(svg, HasSubstr("<title>Maximilian Alexander Theodor von und zu Hohenberg"));
    EXPECT_THAT(svg, Not(HasSubstr(">Maximilian Alexander Theodor von und zu Hohenberg</text>")));
}

}  // namespace
}  // namespace olvane::draw
