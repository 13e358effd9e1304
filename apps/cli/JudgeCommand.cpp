// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Judges pictures, ours or anybody's: what is counted in each, as a table or as JSON.

#include <cli/Commands.h>

#include <optional>

#include <olvane/gedcom/GedcomReader.h>
#include <olvane/picture/PictureJsonReader.h>
#include <olvane/source/GedcomKin.h>

#include <cli/InputBytes.h>
#include <cli/JudgementReport.h>
#include <cli/OutputFile.h>
#include <cli/UsageError.h>

namespace olvane::cli {

namespace {

picture::Picture readPicture(const std::string& path) {
    try {
        return picture::readPictureJson(readInputBytes(path));
    } catch (const picture::PictureJsonError& error) {
        throw UsageError(inputName(path) + ": " + error.what());
    }
}

std::string textOf(const std::vector<JudgedPicture>& pictures, ListFormat format) {
    if (format == ListFormat::json) return judgementsJson(pictures);
    return format == ListFormat::tsv ? judgementsTable(pictures) : judgementsText(pictures);
}

}  // namespace

int runJudge(const JudgeOptions& options) {
    std::optional<kin::KinGraph> known;
    int status = 0;
    if (!options.family.file.empty()) {
        const gedcom::GedcomData data = readFile(options.family);
        known = gedcom::kinGraphOf(data);
        status = statusOfReading(data);
    }
    std::vector<JudgedPicture> pictures;
    for (const std::string& file : options.files) {
        const picture::Picture picture = readPicture(file);
        JudgedPicture judged{inputName(file), picture.view, {}, {}};
        judged.counts = picture::judge(picture, known ? &*known : nullptr, &judged.findings);
        if (hasTrouble(judged.counts)) status = 1;
        pictures.push_back(std::move(judged));
    }
    writeReport(textOf(pictures, options.format));
    return status;
}

}  // namespace olvane::cli
