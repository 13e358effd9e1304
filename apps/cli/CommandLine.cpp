// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The command line: what can be asked for, and what is printed when it is wrong. Every option says in its help what it does and
// what it is when not given.

#include <cli/CommandLine.h>

#include <exception>
#include <map>
#include <memory>
#include <new>

#include <CLI/CLI.hpp>

#include <olvane/gedcom/GedcomEncodings.h>

#include <cli/Commands.h>
#include <cli/HelpFormat.h>
#include <cli/InputFiles.h>
#include <cli/Messages.h>
#include <cli/OptionChecks.h>
#include <cli/PaperOptions.h>
#include <cli/UsageError.h>
#include <cli/ViewOptions.h>

namespace olvane::cli {

namespace {

constexpr int kWrongUse = 2;

std::string unknownEncoding(const std::string& name) {
    std::string text = "'" + name + "' is no known encoding; known are";
    const char* separator = " ";
    for (const std::string_view known : gedcom::encodingNames()) {
        text.append(separator).append(known);
        separator = ", ";
    }
    return text;
}

void addEncoding(CLI::App& command, InputOptions& input) {
    command
        .add_option(
            "--encoding", input.encoding,
            "The encoding of the file, such as UTF-8, ANSEL, windows-1250, ISO-8859-2 or KOI8-R; as the file "
            "says and its text allows when not given. Where that is in doubt the status is 1")
        ->check([](const std::string& name) {
            return gedcom::encodingLabelled(name).empty() ? unknownEncoding(name) : std::string();
        })
        ->type_name("NAME");
}

void addFile(CLI::App& command, InputOptions& input) {
    command.add_option("FILE", input.file, "GEDCOM file: .ged, or a .gdz archive; - for the standard input")
        ->required()
        ->type_name("");
    addEncoding(command, input);
}

void addListFormat(CLI::App& command, ListFormat& format, const char* help) {
    static const std::map<std::string, ListFormat> kFormats = {
        {"text", ListFormat::text}, {"tsv", ListFormat::tsv}, {"json", ListFormat::json}};
    command.add_option("--format", format, help)->transform(choice(kFormats))->type_name("text|tsv|json");
}

void addFocus(CLI::App& command, std::string& focus) {
    command
        .add_option(
            "--focus", focus,
            "The person in the middle: an xref (I17 or @I17@), a number as 'olvane people' prints it, or "
            "words of the name")
        ->required()
        ->type_name("WHO");
}

void addHideLiving(CLI::App& command, HidingOptions& hiding, const std::string& further = "") {
    command.add_flag(
        "--hide-living", hiding.hideLiving,
        "Hide everyone who may be living, as 'Living': no death is recorded and the birth was less than 110 "
        "years ago, or the dates decide nothing and the person is near kin of such a person" +
            further);
    command
        .add_option("--year", hiding.year,
                    "The year that --hide-living counts from; this year if not given, or an earlier one of "
                    "SOURCE_DATE_EPOCH")
        ->check(wholeNumber(1, 9999))
        ->type_name("YEAR");
}

// The subcommands with what they were given.
class CommandLine {
public:
    CommandLine() {
        app_.set_version_flag("--version", "olvane " OLVANE_VERSION);
        app_.require_subcommand(1);
        app_.formatter(std::make_shared<HelpFormat>());
        addPeople();
        addLayout();
        addDraw();
        addBatch();
        addCheck();
        addKin();
        addJudge();
        addPage();
    }

    int run(int argc, char** argv) {
        try {
            app_.parse(argc, argv);
        } catch (const CLI::ParseError& error) {
            if (error.get_exit_code() == 0) return app_.exit(error);
            printMessage(complaintOf(error));
            return kWrongUse;
        }
        refuseWithoutEffect();
        if (people_->parsed()) return runPeople(peopleOptions_);
        if (layout_->parsed()) return runLayout(completedLayoutOptions());
        if (batch_->parsed()) return runBatch(completedBatchOptions());
        if (check_->parsed()) return runCheck(completedCheckOptions());
        if (kin_->parsed()) return runKin(kinOptions_);
        if (judge_->parsed()) return runJudge(judgeOptions_);
        if (page_->parsed()) return runPage(completedPageOptions());
        return runDraw(completedDrawOptions());
    }

private:
    // The library would only ask for a command where the first word is none.
    std::string complaintOf(const CLI::ParseError& error) const {
        const std::vector<std::string> unknownWords = app_.remaining();
        if (app_.get_subcommands().empty() && !unknownWords.empty() &&
            !unknownWords.front().starts_with('-')) {
            return "there is no command '" + unknownWords.front() +
                   "', but people, layout, draw, batch, check, kin, judge and page; 'olvane --help' lists "
                   "more";
        }
        return std::string(error.what()) + "; 'olvane" + nameOfChosen() + " --help' lists more";
    }

    std::string nameOfChosen() const {
        const auto chosen = app_.get_subcommands();
        return chosen.empty() ? "" : " " + chosen.front()->get_name();
    }

    // An option that changes nothing was meant to change something.
    void refuseWithoutEffect() const {
        const CLI::App& command = *app_.get_subcommands().front();
        if (isGiven(command, "--year") && !isGiven(command, "--hide-living")) {
            throw UsageError("--year changes nothing without --hide-living");
        }
    }

    static bool isGiven(const CLI::App& command, const char* option) {
        return command.get_option_no_throw(option) != nullptr && command.count(option) > 0;
    }

    void addPeople() {
        people_ = app_.add_subcommand("people", "List persons with ids, names and years");
        addFile(*people_, peopleOptions_.input);
        people_
            ->add_option("WORDS", peopleOptions_.words,
                         "Words that the name must hold; everybody without any")
            ->type_name("");
        addListFormat(
            *people_, peopleOptions_.format,
            "text: id, xref, name and years (default); tsv and json: all fields, for other programs");
    }

    void addLayout() {
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

    void addDraw() {
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
            ->add_option("--theme", drawOptions_.theme,
                         "Colours: light (default), dark, or print for little ink")
            ->check(word({"light", "dark", "print"}))
            ->type_name("light|dark|print");
        draw_->add_option("--title", drawOptions_.title, "Title above the picture; none is drawn without it")
            ->type_name("TEXT");
        addPaperOptions(*draw_, drawOptions_.paper);
        draw_->add_flag("--unknown-parents", drawOptions_.request.unknownParents,
                        "Draw dashed boxes for parents who are not known, in family and pedigree");
        draw_
            ->add_option(
                "--show", drawShown_,
                "What boxes say beside names and years, a list of dates (in full), places, occupation, "
                "and marriage for its year at the line of the couple")
            ->delimiter(',')
            ->check(word({"dates", "places", "occupation", "marriage"}))
            ->type_name("WHAT,...");
        addHideLiving(*draw_, drawOptions_.hiding);
    }

    void addBatch() {
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

    void addCheck() {
        check_ =
            app_.add_subcommand("check", "List what is wrong or odd in a file, or hard to read in a layout");
        addFile(*check_, checkOptions_.input);
        CLI::Option* focus = check_
                                 ->add_option("--focus", checkOptions_.focus,
                                              "Look at this person's layout as well, an xref, a number of "
                                              "'olvane people' or words of the "
                                              "name: boxes that overlap, lines through boxes, two families' "
                                              "lines on one track, persons in several boxes")
                                 ->type_name("WHO");
        check_
            ->add_flag(
                "--all", checkOptions_.all,
                "Look at everybody's layout as well: a line of counts for each, with ids, and the totals")
            ->excludes(focus);
        addListFormat(
            *check_, checkOptions_.format,
            "text: for people (default); tsv: the remarks on the data, with all fields; json: these and what "
            "is hard to read in the layouts");
        addViewOptions(*check_, checkOptions_.request,
                       "default tall, and wide in a pedigree and in charts that lie sideways");
    }

    void addKin() {
        kin_ = app_.add_subcommand("kin", "Say how two persons are related, and list the ways between them");
        addFile(*kin_, kinOptions_.input);
        const char* const who = "an xref, a number of 'olvane people' or words of the name";
        kin_->add_option("A", kinOptions_.a, std::string("The person to start from: ") + who)
            ->required()
            ->type_name("");
        kin_->add_option("B", kinOptions_.b, std::string("The person who is a relative of A: ") + who)
            ->required()
            ->type_name("");
        static const std::map<std::string, bool> kFormats = {{"text", false}, {"json", true}};
        kin_->add_option(
                "--format", kinOptions_.json,
                "text: what B is to A, then a line for each way (default); json: the ways, how many there "
                "are, and the kinship coefficient")
            ->transform(choice(kFormats))
            ->type_name("text|json");
        kin_->add_option("--ways", kinOptions_.ways, "The most ways of each sort that are listed; default 50")
            ->check(wholeNumber(1, 1000000))
            ->type_name("N");
        kin_->add_option(
                "--language", kinOptions_.language,
                "Language of the words: en, de or es; that of the environment when not given, or English")
            ->check(word({"en", "de", "es"}))
            ->type_name("en|de|es");
    }

    void addJudge() {
        judge_ = app_.add_subcommand("judge", "Count what makes a picture hard to read, in pictures as JSON");
        judge_
            ->add_option("PICTURE", judgeOptions_.files,
                         "Pictures as 'olvane layout --format json' prints them; - for the standard input")
            ->required()
            ->type_name("");
        CLI::Option* family =
            judge_
                ->add_option("--family", judgeOptions_.family.file,
                             "GEDCOM file of the family, to count relations of it that a picture "
                             "does not express")
                ->type_name("FILE");
        addEncoding(*judge_, judgeOptions_.family);
        judge_->get_option("--encoding")->needs(family);
        addListFormat(
            *judge_, judgeOptions_.format,
            "text: a line for each count (default); tsv: a line for each picture; json: with what each "
            "count is about");
    }

    void addPage() {
        page_ = app_.add_subcommand("page",
                                    "Write a page to explore the family in any browser, without a network");
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
                ->add_option(
                    "--focus", pageOptions_.focus,
                    "The person in the middle when the page opens: an xref, a number of 'olvane people' "
                    "or words of the name; the page's own choice when not given")
                ->type_name("WHO");
        addPageViewOptions(*page_, pageOptions_.request);
        page_->add_flag(
            "--map", pageOptions_.map,
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

    void addPageContents() {
        CLI::Option* notes = page_->add_flag_callback(
            "--no-notes", [this] { pageOptions_.notes = false; }, "Leave notes and sources out");
        CLI::Option* media = page_->add_flag_callback(
            "--no-media", [this] { pageOptions_.media = false; },
            "Leave out which pictures and documents the file links to");
        CLI::Option* photos =
            page_
                ->add_option(
                    "--photos", pageOptions_.photoSize,
                    "Put photographs into the page, scaled down to so many pixels on the longer side: those "
                    "in the .gdz archive, or in the folder of the file and below it")
                ->check(wholeNumber(16, 4096))
                ->type_name("SIZE")
                ->excludes(media);
        needsFile(notes);
        needsFile(media);
        needsFile(photos);
    }

    // Without a family these would change nothing.
    void needsFile(CLI::Option* option) { option->needs(page_->get_option("FILE")); }

    static void refuseMirroredText(const LayoutRequest& request, bool isPicture) {
        if (!request.chart.mirrored || isPicture) return;
        throw UsageError(
            "--mirror changes pictures, and no result text; --format json of olvane layout is a picture");
    }

    LayoutOptions completedLayoutOptions() const {
        LayoutOptions options = layoutOptions_;
        completeViewOptions(*layout_, options.request);
        options.request.unknownParents = true;  // they are in the layout
        if (isEngineView(options.request.view())) {
            refuseMirroredText(options.request, options.format == LayoutFormat::json);
            return options;
        }
        if (!isGiven(*layout_, "--format")) options.format = LayoutFormat::json;
        if (options.format != LayoutFormat::json) {
            throw UsageError(
                std::string("--format: the view ") + charts::nameOf(options.request.view()) +
                " is printed as json alone; text and json1 are of the views family and pedigree");
        }
        return options;
    }

    BatchOptions completedBatchOptions() const {
        BatchOptions options = batchOptions_;
        completeViewOptions(*batch_, options.request);
        refuseMirroredText(options.request, !isEngineView(options.request.view()));
        return options;
    }

    DrawOptions completedDrawOptions() const {
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

    CheckOptions completedCheckOptions() const {
        CheckOptions options = checkOptions_;
        if (options.format == ListFormat::tsv && (options.all || !options.focus.empty())) {
            throw UsageError(
                "--format tsv lists the remarks on the data alone; text and json list layouts as well");
        }
        completeViewOptions(*check_, options.request);
        widenSideways(*check_, options.request);
        return options;
    }

    PageOptions completedPageOptions() const {
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
    static void widenSideways(const CLI::App& command, LayoutRequest& request, bool onPaper = false) {
        if (isGiven(command, "--boxes")) return;
        const charts::Direction direction = request.chart.direction;
        request.boxes = onPaper ? charts::usualBoxFormOnPaper(request.view(), direction)
                                : charts::usualBoxForm(request.view(), direction);
    }

    CLI::App app_{"Family trees from GEDCOM files: lists persons, lays out families and draws them.",
                  "olvane"};
    CLI::App* people_ = nullptr;
    CLI::App* layout_ = nullptr;
    CLI::App* draw_ = nullptr;
    CLI::App* batch_ = nullptr;
    CLI::App* check_ = nullptr;
    CLI::App* kin_ = nullptr;
    CLI::App* judge_ = nullptr;
    CLI::App* page_ = nullptr;
    PeopleOptions peopleOptions_;
    LayoutOptions layoutOptions_;
    DrawOptions drawOptions_;
    std::vector<std::string> drawShown_;
    BatchOptions batchOptions_;
    CheckOptions checkOptions_;
    KinOptions kinOptions_;
    JudgeOptions judgeOptions_;
    PageOptions pageOptions_;
};

// The files that the words of a command line may name for reading.
std::vector<std::string> wordsThatMayBeInput(int argc, char** argv) {
    std::vector<std::string> words;
    for (int i = 1; i < argc; ++i) {
        const std::string word = argv[i];
        const bool namesOutput = word == "-o" || word == "--output";
        if (namesOutput) ++i;
        if (namesOutput || word.starts_with("-o")) continue;
        const std::size_t value = word.starts_with("--") ? word.find('=') + 1 : 0;
        if (!word.starts_with("--output=")) words.push_back(word.substr(value));
    }
    return words;
}

}  // namespace

int runCommand(int argc, char** argv) {
    try {
        refuseStreamsIntoInputs(InputFiles(wordsThatMayBeInput(argc, argv)));
        return CommandLine().run(argc, argv);
    } catch (const UsageError& error) {
        printMessage(error.what());
    } catch (const std::bad_alloc&) {
        printMessage("not enough memory");
    } catch (const std::exception& error) {
        printMessage(error.what());
    }
    return kWrongUse;
}

}  // namespace olvane::cli
