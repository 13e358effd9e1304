// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A file is drawn in one call, as the C interface draws it, or an error says what is wrong.

#import <olvane/foundation/OlvaneDrawing.h>

#include <gtest/gtest.h>

#include <cstddef>
#include <fstream>
#include <string>

#include <FileDrawing.h>

namespace {

// A couple, who married in 1855, and their child, who was born in 1990.
const char* const kFamily =
    "0 HEAD\n1 GEDC\n2 VERS 5.5.1\n1 CHAR UTF-8\n"
    "0 @I1@ INDI\n1 NAME Ada /Berg/\n1 SEX F\n1 BIRT\n2 DATE 1 MAY 1830\n2 PLAC Ulm\n1 FAMS @F1@\n"
    "0 @I2@ INDI\n1 NAME Bo /Carl/\n1 SEX M\n1 FAMS @F1@\n"
    "0 @I3@ INDI\n1 NAME Cy /Carl/\n1 SEX M\n1 BIRT\n2 DATE 1990\n1 FAMC @F1@\n"
    "0 @F1@ FAM\n1 HUSB @I2@\n1 WIFE @I1@\n1 CHIL @I3@\n1 MARR\n2 DATE 1855\n0 TRLR\n";

class FoundationDrawing : public testing::Test {
protected:
    FoundationDrawing() : pool_([[NSAutoreleasePool alloc] init]) { std::ofstream(path()) << kFamily; }
    ~FoundationDrawing() override { [pool_ release]; }

    static std::string path() { return testing::TempDir() + "foundation_drawing_test.ged"; }
    static NSString* file() { return [NSString stringWithUTF8String:path().c_str()]; }

    static std::string drawn(OlvaneDrawingOptions* options, NSString* who = @"Cy Carl") {
        NSError* error = nil;
        NSString* svg = [OlvaneDrawing svgOfFile:file() person:who options:options error:&error];
        EXPECT_TRUE(error == nil) << [[error localizedDescription] UTF8String];
        return svg ? [svg UTF8String] : "";
    }

    // The code and the description of what fails.
    static std::string failure(NSString* path, NSString* who, OlvaneDrawingOptions* options) {
        NSError* error = nil;
        EXPECT_TRUE([OlvaneDrawing svgOfFile:path person:who options:options error:&error] == nil);
        EXPECT_TRUE([[error domain] isEqualToString:OlvaneErrorDomain]);
        return std::to_string([error code]) + " " + [[error localizedDescription] UTF8String];
    }

private:
    NSAutoreleasePool* pool_;
};

TEST_F(FoundationDrawing, isThatOfTheCInterfaceInEveryView) {
    const char* const names[] = {"family",    "pedigree",  "near", "ancestors", "descendants",
                                 "hourglass", "relatives", "fan",  "kinship",   "everybody"};
    for (int view = OlvaneViewFamily; view <= OlvaneViewEverybody; ++view) {
        OlvaneDrawingOptions* options = [OlvaneDrawingOptions optionsForView:view];
        options.other = @"Ada Berg";
        olvane_draw_options expected = {};
        expected.view = names[view];
        expected.to = 1;
        EXPECT_EQ(olvane::c::drawnFromPath(path().c_str(), "3", expected), drawn(options)) << names[view];
    }
    EXPECT_EQ(drawn([OlvaneDrawingOptions optionsForView:OlvaneViewFamily]), drawn(nil));
}

TEST_F(FoundationDrawing, takesEachOption) {
    OlvaneDrawingOptions* options = [OlvaneDrawingOptions optionsForView:OlvaneViewAncestors];
    const std::string plain = drawn(options);
    options.title = @"The Carls";
    options.places = YES;
    options.dates = YES;
    options.marriage = YES;
    options.theme = OlvaneThemeDark;
    options.boxes = OlvaneBoxesWide;
    options.direction = 3;
    olvane_draw_options expected = {};
    expected.view = "ancestors";
    expected.title = "The Carls";
    expected.places = expected.dates = expected.marriage = 1;
    expected.theme = "dark";
    expected.boxes = "wide";
    expected.direction = "right";
    const std::string all = drawn(options);
    EXPECT_EQ(olvane::c::drawnFromPath(path().c_str(), "3", expected), all);
    EXPECT_NE(plain, all);
    EXPECT_NE(std::string::npos, all.find("Ulm"));
}

TEST_F(FoundationDrawing, hidesTheLivingWhereItIsAsked) {
    OlvaneDrawingOptions* options = [OlvaneDrawingOptions optionsForView:OlvaneViewFamily];
    EXPECT_NE(std::string::npos, drawn(options).find("Cy"));
    options.hideLiving = YES;
    options.year = 2020;
    EXPECT_EQ(std::string::npos, drawn(options).find("Cy"));
}

TEST_F(FoundationDrawing, saysWhatIsWrong) {
    EXPECT_EQ("8 /no/such/file.ged: does not exist", failure(@"/no/such/file.ged", @"1", nil));
    EXPECT_EQ("2 " + path() + ": 'Carl' may be any of 2 persons", failure(file(), @"Carl", nil));
    EXPECT_EQ("2 " + path() + ": no person is called 'Dora'", failure(file(), @"Dora", nil));
    OlvaneDrawingOptions* options = [OlvaneDrawingOptions optionsForView:10];
    EXPECT_EQ(0u, failure(file(), @"1", options).find("1 view is '10', and takes family, "));
    options = [OlvaneDrawingOptions optionsForView:OlvaneViewFamily];
    options.direction = -1;
    EXPECT_EQ("1 direction is '-1', and takes down, up, left or right", failure(file(), @"1", options));
    options = [OlvaneDrawingOptions optionsForView:OlvaneViewKinship];
    EXPECT_EQ(0u, failure(file(), @"1", options).find("2 "));
    EXPECT_TRUE([OlvaneDrawing svgOfFile:nil person:nil options:nil error:NULL] == nil);
}

}  // namespace
