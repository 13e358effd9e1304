// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The commands that lay out: layout, draw, batch and page, with what they are given.

#include <map>

#include <cli/CommonOptions.h>
#include <cli/OptionChecks.h>
#include <cli/PaperOptions.h>
#include <cli/Subcommands.h>
#include <cli/UsageError.h>
#include <cli/ViewOptions.h>

namespace olvane::cli {

void CommandLine::addLayout() {
    layout_ = app_.add_subcommand("layout", "Print where everybody stands, as text or as data");
    addFile(*layout_, layoutOptions_.input);
    addFocus(*layout_, layoutOptions_.focus);
    layout_
        ->add_option(
            "--format", layoutOptions_.format,
            "text: a record for each box on one line, of the views family and pedigree (their default); "
            "json: the picture with names and dates of the persons (default of the other views); json1: "
            "the older form of json, of family and pedigree")
        ->transform(choice(std::map<std::string, LayoutFormat>{
            {"text", LayoutFormat::text}, {"json", LayoutFormat::json}, {"json1", LayoutFormat::json1}}))
        ->type_name("text|json|json1");
    addViewOptions(*layout_, layoutOptions_.request, "default tall");
    addHideLiving(*layout_, layoutOptions_.hiding);
}

void CommandLine::addDraw() {
    draw_ = app_.add_subcommand("draw", "Draw a picture of a person's family, in any view");
    addFile(*draw_, drawOptions_.input);
    addFocus(*draw_, drawOptions_.focus);
    draw_
        ->add_option("-o,--output", drawOptions_.output,
                     "Picture to write: .svg, .png or .pdf; - writes SVG to the standard output")
        ->required()
        ->type_name("OUT");
    addViewOptions(
        *draw_, drawOptions_.request,
        "default tall, and wide in a pedigree, in charts that lie sideways, and in everybody with --fit");
    draw_
        ->add_option("--theme", drawOptions_.theme, "Colours: light (default), dark, or print for little ink")
        ->check(word({"light", "dark", "print"}))
        ->type_name("light|dark|print");
    draw_->add_option("--title", drawOptions_.title, "Title above the picture; none is drawn without it")
        ->type_name("TEXT");
    addPaperOptions(*draw_, drawOptions_.paper);
    draw_->add_flag("--unknown-parents", drawOptions_.request.unknownParents,
                    "Draw dashed boxes for parents who are not known, in family and pedigree");
    draw_
        ->add_option("--show", drawShown_,
                     "What boxes say beside names and years, a list of dates (in full), places, occupation, "
                     "and marriage for its year at the line of the couple")
        ->delimiter(',')
        ->check(word({"dates", "places", "occupation", "marriage"}))
        ->type_name("WHAT,...");
    addHideLiving(*draw_, drawOptions_.hiding);
}

void CommandLine::addBatch() {
    batch_ = app_.add_subcommand(
        "batch",
        "Print many layouts: id, a tab and the result text, or a picture as JSON, on a line for each");
    addFile(*batch_, batchOptions_.input);
    batch_
        ->add_option("--focus-from", batchOptions_.focusFrom,
                     "File with the focuses, an id or xref on each line; - for the standard input. A "
                     "bare number is "
                     "an id first. Everybody when not given")
        ->type_name("FROM");
    batch_
        ->add_flag("--unbuffered", batchOptions_.unbuffered,
                   "Answer each line before the next one is read, for a program that asks and waits")
        ->needs("--focus-from");
    addViewOptions(*batch_, batchOptions_.request, "default tall");
}

void CommandLine::addPage() {
    page_ =
        app_.add_subcommand("page", "Write a page to explore the family in any browser, without a network");
    page_
        ->add_option(
            "FILE", pageOptions_.input.file,
            "GEDCOM file: .ged, or a .gdz archive; - for the standard input. Without one the page asks "
            "for it when opened")
        ->type_name("");
    addEncoding(*page_, pageOptions_.input);
    page_->add_option("-o,--output", pageOptions_.output, "Page to write; - for the standard output")
        ->required()
        ->type_name("OUT.html");
    CLI::Option* focus =
        page_
            ->add_option("--focus", pageOptions_.focus,
                         "The person in the middle when the page opens: an xref, a number of 'olvane people' "
                         "or words of the name; the page's own choice when not given")
            ->type_name("WHO");
    addPageViewOptions(*page_, pageOptions_.request);
    page_->add_flag("--map", pageOptions_.map,
                    "Open the page with everybody as one map, which is laid out here and may have up to two "
                    "million persons");
    page_
        ->add_option("--title", pageOptions_.title,
                     "Title of the page; the name of --focus when not given, or that of the file")
        ->type_name("TEXT");
    addPageContents();
    addHideLiving(*page_, pageOptions_.hiding, "; nor any free text about others that may name them");
    needsFile(focus);
    needsFile(page_->get_option("--encoding"));
    needsFile(page_->get_option("--hide-living"));
    needsFile(page_->get_option("--map"));
    needsFile(page_->get_option("--title"));
    for (const std::string& name : pageViewOptionNames()) needsFile(page_->get_option(name));
}

void CommandLine::addPageContents() {
    CLI::Option* notes = page_->add_flag_callback(
        "--no-notes", [this] { pageOptions_.notes = false; }, "Leave notes and sources out");
    CLI::Option* media = page_->add_flag_callback(
        "--no-media", [this] { pageOptions_.media = false; },
        "Leave out which pictures and documents the file links to");
    CLI::Option* photos =
        page_
            ->add_option(
                "--photos", pageOptions_.photoSize,
                "Put photographs into the page, scaled down to SIZE pixels on the longer side: those "
                "in the .gdz archive, or in the folder of the file and below it")
            ->check(wholeNumber(16, 4096))
            ->type_name("SIZE")
            ->excludes(media);
    needsFile(notes);
    needsFile(media);
    needsFile(photos);
}

void CommandLine::refuseMirroredText(const LayoutRequest& request, bool isPicture) {
    if (!request.chart.mirrored || isPicture) return;
    throw UsageError(
        "--mirror changes pictures, and no result text; --format json of olvane layout is a picture");
}

LayoutOptions CommandLine::completedLayoutOptions() const {
    LayoutOptions options = layoutOptions_;
    completeViewOptions(*layout_, options.request);
    options.request.unknownParents = true;  // they are in the layout
    if (isEngineView(options.request.view())) {
        refuseMirroredText(options.request, options.format == LayoutFormat::json);
        return options;
    }
    if (!isGiven(*layout_, "--format")) options.format = LayoutFormat::json;
    if (options.format != LayoutFormat::json) {
        throw UsageError(std::string("--format: the view ") + charts::nameOf(options.request.view()) +
                         " is printed as json alone; text and json1 are of the views family and pedigree");
    }
    return options;
}

BatchOptions CommandLine::completedBatchOptions() const {
    BatchOptions options = batchOptions_;
    completeViewOptions(*batch_, options.request);
    refuseMirroredText(options.request, !isEngineView(options.request.view()));
    return options;
}

DrawOptions CommandLine::completedDrawOptions() const {
    DrawOptions options = drawOptions_;
    completeViewOptions(*draw_, options.request);
    widenSideways(*draw_, options.request, options.paper.onPaper());
    checkPaperOptions(options.paper, options.output);
    for (const std::string& what : drawShown_) {
        options.shown.dates = options.shown.dates || what == "dates";
        options.shown.places = options.shown.places || what == "places";
        options.shown.occupation = options.shown.occupation || what == "occupation";
        options.shown.marriage = options.shown.marriage || what == "marriage";
    }
    return options;
}

PageOptions CommandLine::completedPageOptions() const {
    constexpr int kMostColumns = 10;
    PageOptions options = pageOptions_;
    completeViewOptions(*page_, options.request);
    const int columns = options.request.chart.layout.generations;
    if (options.request.view() == View::pedigree && (columns < 2 || columns > kMostColumns)) {
        throw UsageError("--generations: the pedigree of a page has 2 to 10 generations");
    }
    if (!options.request.to.empty() && options.focus.empty()) throw UsageError("--to needs --focus");
    options.address = pageAddressOf(*page_, options.request);
    return options;
}

// Pictures that lie sideways have wide boxes, and what is checked is the picture.
void CommandLine::widenSideways(const CLI::App& command, LayoutRequest& request, bool onPaper) {
    if (isGiven(command, "--boxes")) return;
    const charts::Direction direction = request.chart.direction;
    request.boxes = onPaper ? charts::usualBoxFormOnPaper(request.view(), direction)
                            : charts::usualBoxForm(request.view(), direction);
}

}  // namespace olvane::cli
