// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Lines of GEDCOM: level, perhaps an identifier, tag, perhaps a value. The depth of a line is one more than
// that of the nearest line before it with a smaller number, which for sound files is the number itself. Only
// the topmost depths matter to the reader, so nothing grows with the depth of a file.

#include <olvane/gedcom/LineScannerInternal.h>

#include <algorithm>
#include <cstring>

namespace olvane::gedcom {
namespace {

constexpr std::string_view kByteOrderMark = "\xEF\xBB\xBF";
constexpr std::uint32_t kHighestLevel = 1000000;

bool isBlank(char c) {
    return c == ' ' || c == '\t';
}
bool isDigit(char c) {
    return c >= '0' && c <= '9';
}

constexpr std::array<bool, 256> kTagLetters = [] {
    std::array<bool, 256> letters{};
    for (std::size_t c = 0; c < letters.size(); ++c) {
        letters[c] = (c >= '0' && c <= '9') || (c >= 'A' && c <= 'Z') || (c >= 'a' && c <= 'z') || c == '_' ||
                     c >= 0x80;
    }
    return letters;
}();

bool isTagLetter(char c) {
    return kTagLetters[static_cast<unsigned char>(c)];
}

std::string_view withoutLeadingBlanks(std::string_view text) {
    while (!text.empty() && isBlank(text.front())) text.remove_prefix(1);
    return text;
}

std::size_t find(std::string_view bytes, std::size_t from, char wanted) {
    const void* found = std::memchr(bytes.data() + from, wanted, bytes.size() - from);
    return found == nullptr ? bytes.size()
                            : static_cast<std::size_t>(static_cast<const char*>(found) - bytes.data());
}

// Takes the number at the front; what is higher than any sensible level counts as kHighestLevel.
std::uint32_t takeNumber(std::string_view& rest) {
    std::uint32_t number = 0;
    while (!rest.empty() && isDigit(rest.front())) {
        number = std::min(number * 10 + static_cast<std::uint32_t>(rest.front() - '0'), kHighestLevel);
        rest.remove_prefix(1);
    }
    return number;
}

// The digits as written, but for zeros in front; those of a line of digits are cut.
std::string shownLevel(std::string_view digits) {
    constexpr std::size_t kShown = 60;
    while (digits.size() > 1 && digits.front() == '0') digits.remove_prefix(1);
    return std::string(digits.substr(0, kShown)) + (digits.size() > kShown ? "..." : "");
}

// Whether a text may begin with a CONC or CONT line: a look at a few characters that spares looking for the
// line's end.
bool mayContinue(std::string_view rest) {
    std::size_t at = 0;
    while (at < rest.size() && (isBlank(rest[at]) || isDigit(rest[at]))) ++at;
    return at > 0 && rest.substr(at, 3) == "CON";
}

// A CONC or CONT line below a level.
struct Continuation {
    bool isOne = false;
    bool newLine = false;
    std::string_view text;
};

Continuation readContinuation(std::string_view text, std::uint32_t aboveLevel) {
    std::string_view rest = withoutLeadingBlanks(text);
    if (rest.empty() || !isDigit(rest.front())) return {};
    const std::uint32_t level = takeNumber(rest);
    rest = withoutLeadingBlanks(rest);
    const bool conc = rest.starts_with("CONC");
    if (level <= aboveLevel || (!conc && !rest.starts_with("CONT"))) return {};
    rest.remove_prefix(4);
    if (!rest.empty() && !isBlank(rest.front())) return {};
    return {true, !conc, rest.empty() ? rest : rest.substr(1)};
}

}  // namespace

std::string_view trimmed(std::string_view text) {
    text = withoutLeadingBlanks(text);
    while (!text.empty() && isBlank(text.back())) text.remove_suffix(1);
    return text;
}

std::size_t findConcText(std::string_view rest) {
    std::size_t at = 0;
    while (at < 2 && at < rest.size() && rest[at] == '\r') ++at;
    if (at < rest.size() && rest[at] == '\n') ++at;
    if (at == 1 && rest.front() == '\n' && at < rest.size() && rest[at] == '\r') ++at;
    if (at == 0) return std::string_view::npos;
    while (at < rest.size() && (isDigit(rest[at]) || isBlank(rest[at]))) ++at;
    return rest.substr(at, 5) == "CONC " ? at + 5 : std::string_view::npos;
}

LineCutter::LineCutter(std::string_view bytes)
    : bytes_(bytes), nextLf_(find(bytes, 0, '\n')), nextCr_(find(bytes, 0, '\r')) {}

bool LineCutter::next(std::string_view& text) {
    if (at_ >= bytes_.size()) return false;
    if (nextLf_ < at_) nextLf_ = find(bytes_, at_, '\n');
    if (nextCr_ < at_) nextCr_ = find(bytes_, at_, '\r');
    const std::size_t end = std::min(nextLf_, nextCr_);
    text = bytes_.substr(at_, end - at_);
    at_ = end;
    const bool isPlainLf = standsAt('\n', 0) && !standsAt('\r', 1);
    isPlainLf ? static_cast<void>(++at_) : skipEnd();
    ++number_;
    return true;
}

// "LF CR LF" may be an LF and an empty line that ends in CRLF; the first line end of the file decides.
void LineCutter::skipEnd() {
    if (standsAt('\n', 0)) {
        const bool lfCr = standsAt('\r', 1) && (endsInLfCr_ || !standsAt('\n', 2));
        if (number_ == 0) endsInLfCr_ = lfCr;
        at_ += lfCr ? 2 : 1;
    } else if (standsAt('\r', 0)) {
        if (standsAt('\r', 1) && standsAt('\n', 2)) ++at_;
        at_ += standsAt('\n', 1) ? 2 : 1;
    }
}

LineScanner::LineScanner(std::string_view bytes, DiagnosticList& diagnostics)
    : cutter_(bytes), diagnostics_(diagnostics) {}

bool LineScanner::next(GedcomLine& line) {
    std::string_view text;
    while (cutter_.next(text)) {
        line.number = cutter_.number();
        if (parse(text, line)) {
            settleDepth(line);
            return true;
        }
    }
    return false;
}

bool LineScanner::parse(std::string_view text, GedcomLine& line) {
    std::string_view rest = withoutLeadingBlanks(text);
    if (rest.starts_with(kByteOrderMark)) rest.remove_prefix(kByteOrderMark.size());
    if (rest.empty()) {
        diagnostics_.count(DiagnosticKind::emptyLine, line.number);
        return false;
    }
    if (!takeLevel(rest, line) || !takeXref(rest, line) || !takeTagAndValue(rest, line))
        return refuse(text, line);
    return true;
}

bool LineScanner::refuse(std::string_view text, const GedcomLine& line) {
    diagnostics_.add(DiagnosticKind::notALine, Severity::error, line.number,
                     DiagnosticSentence::noLevelAndTag, DiagnosticSentence::skipped, text);
    return false;
}

// Nearly all levels are one digit and a space.
bool LineScanner::takeLevel(std::string_view& rest, GedcomLine& line) {
    if (rest.size() < 3 || !isDigit(rest[0]) || rest[1] != ' ') return takeUnusualLevel(rest, line);
    writtenLevel_ = static_cast<std::uint32_t>(rest[0] - '0');
    levelDigits_ = rest.substr(0, 1);
    rest.remove_prefix(2);
    if (isBlank(rest.front())) rest = withoutLeadingBlanks(rest);
    return true;
}

bool LineScanner::takeUnusualLevel(std::string_view& rest, GedcomLine& line) {
    const bool negative = rest.front() == '-';
    std::string_view digits = rest.substr(negative ? 1 : 0);
    if (digits.empty() || !isDigit(digits.front())) return false;
    const bool padded = digits.size() > 1 && digits[0] == '0' && isDigit(digits[1]);
    const std::string_view allDigits = digits;
    writtenLevel_ = takeNumber(digits);
    levelDigits_ = allDigits.substr(0, allDigits.size() - digits.size());
    const std::string_view written = rest.substr(0, levelDigits_.size() + (negative ? 1 : 0));
    const bool parted = !digits.empty() && isBlank(digits.front());
    if (!parted && (digits.empty() || (digits.front() != '@' && !isTagLetter(digits.front())))) return false;
    if (negative || padded || !parted) {
        diagnostics_.add(DiagnosticKind::wrongLevel, Severity::warning, line.number,
                         DiagnosticSentence::badlyWrittenLevel,
                         writtenLevel_ < kHighestLevel
                             ? DiagnosticPhrase{DiagnosticSentence::asLevel, {std::to_string(writtenLevel_)}}
                             : DiagnosticPhrase{DiagnosticSentence::asOneBelow},
                         written);
    }
    rest = withoutLeadingBlanks(digits);
    return true;
}

bool LineScanner::takeXref(std::string_view& rest, GedcomLine& line) {
    line.xref = {};
    if (rest.empty() || rest.front() != '@') return true;
    std::size_t end = rest.find('@', 1);
    const bool closed = end != std::string_view::npos && (end + 1 == rest.size() || isBlank(rest[end + 1]));
    if (!closed) {
        end = std::min(rest.find(' '), rest.size());
        diagnostics_.add(DiagnosticKind::brokenXref, Severity::warning, line.number,
                         DiagnosticSentence::identifierWithoutEnd, DiagnosticSentence::upToSpace,
                         rest.substr(0, end));
    }
    line.xref = trimmed(rest.substr(1, end - 1));
    rest = withoutLeadingBlanks(rest.substr(closed ? end + 1 : end));
    return true;
}

// rest comes by value, in registers: a copy of both its halves at once would wait for the stores of each.
bool LineScanner::takeTagAndValue(std::string_view rest, GedcomLine& line) {
    std::size_t length = 0;
    while (length < rest.size() && isTagLetter(rest[length])) ++length;
    if (length == 0 || (length < rest.size() && !isBlank(rest[length]))) return false;
    line.tag = rest.substr(0, length);
    line.value = rest.substr(std::min(length + 1, rest.size()));
    return true;
}

void LineScanner::settleDepth(GedcomLine& line) {
    while (ancestorCount_ > 1 && ancestors_[ancestorCount_ - 1] >= writtenLevel_) --ancestorCount_;
    line.level = writtenLevel_ == 0 ? 0 : ancestorCount_;
    if (writtenLevel_ != 0 && ancestorCount_ < ancestors_.size())
        ancestors_[ancestorCount_++] = writtenLevel_;
    if (writtenLevel_ > previousLevel_ + 1) {
        diagnostics_.add(DiagnosticKind::levelJump, Severity::warning, line.number,
                         DiagnosticPhrase{DiagnosticSentence::jumpingLevel,
                                          {std::to_string(previousLevel_), shownLevel(levelDigits_)}},
                         DiagnosticSentence::asOneBelow, line.tag);
    }
    previousLevel_ = writtenLevel_;
}

std::string_view LineScanner::wholeValue(const GedcomLine& line) {
    LineCutter ahead = cutter_;
    std::string_view text;
    bool joining = false;
    while (mayContinue(ahead.rest())) {
        ahead.next(text);
        const Continuation more = readContinuation(text, writtenLevel_);
        if (!more.isOne) break;
        if (!joining) joined_.assign(line.value);
        joining = true;
        if (more.newLine) joined_ += '\n';
        joined_ += more.text;
    }
    return joining ? std::string_view(joined_) : line.value;
}

}  // namespace olvane::gedcom
