// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The commands that list: people, check, kin and judge, with what they are given.

#include <map>

#include <cli/CommonOptions.h>
#include <cli/OptionChecks.h>
#include <cli/Subcommands.h>
#include <cli/UsageError.h>
#include <cli/ViewOptions.h>

namespace olvane::cli {

void CommandLine::addPeople() {
    people_ = app_.add_subcommand("people", "List persons with ids, names and years");
    addFile(*people_, peopleOptions_.input);
    people_->add_option("WORDS", peopleOptions_.words, "Words that the name must hold; everybody without any")
        ->type_name("");
    addListFormat(*people_, peopleOptions_.format,
                  "text: id, xref, name and years (default); tsv and json: all fields, for other programs");
}

void CommandLine::addCheck() {
    check_ = app_.add_subcommand("check", "List what is wrong or odd in a file, or hard to read in a layout");
    addFile(*check_, checkOptions_.input);
    CLI::Option* focus = check_
                             ->add_option("--focus", checkOptions_.focus,
                                          "Look at this person's layout as well, an xref, a number of "
                                          "'olvane people' or words of the "
                                          "name: boxes that overlap, lines through boxes, two families' "
                                          "lines on one track, persons in several boxes")
                             ->type_name("WHO");
    check_
        ->add_flag("--all", checkOptions_.all,
                   "Look at everybody's layout as well: a line of counts for each, with ids, and the totals")
        ->excludes(focus);
    addListFormat(
        *check_, checkOptions_.format,
        "text: for people (default); tsv: the remarks on the data, with all fields; json: these and what "
        "is hard to read in the layouts");
    addViewOptions(*check_, checkOptions_.request,
                   "default tall, and wide in a pedigree and in charts that lie sideways");
}

void CommandLine::addKin() {
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

void CommandLine::addJudge() {
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
    addListFormat(*judge_, judgeOptions_.format,
                  "text: a line for each count (default); tsv: a line for each picture; json: with what each "
                  "count is about");
}

CheckOptions CommandLine::completedCheckOptions() const {
    CheckOptions options = checkOptions_;
    if (options.format == ListFormat::tsv && (options.all || !options.focus.empty())) {
        throw UsageError(
            "--format tsv lists the remarks on the data alone; text and json list layouts as well");
    }
    completeViewOptions(*check_, options.request);
    widenSideways(*check_, options.request);
    return options;
}

}  // namespace olvane::cli
