// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include "KinFamily.h"

#include <sstream>
#include <vector>

using namespace olvane::kin;

namespace {

struct Member {
    std::string name;
    Sex sex;
    ChildKind kind = ChildKind::birth;
};

Member memberOf(std::string text, Sex sex) {
    static const std::map<std::string, ChildKind> kKinds{
        {"adopted", ChildKind::adopted}, {"foster", ChildKind::foster},   {"step", ChildKind::step},
        {"sealing", ChildKind::sealing}, {"unknown", ChildKind::unknown},
    };
    Member member{"", sex};
    const std::size_t bracket = text.find('(');
    if (bracket != std::string::npos) {
        member.kind = kKinds.at(text.substr(bracket + 1, text.size() - bracket - 2));
        text.erase(bracket);
    }
    const std::size_t dot = text.find('.');
    if (dot != std::string::npos) {
        member.sex = text[dot + 1] == 'm' ? Sex::male : text[dot + 1] == 'f' ? Sex::female : Sex::unknown;
        text.erase(dot);
    }
    member.name = text;
    return member;
}

struct Line {
    std::vector<Member> partners;
    UnionState state;
    std::vector<Member> children;
};

Line lineOf(const std::string& text) {
    const std::size_t colon = text.find(':');
    std::istringstream couple(text.substr(0, colon));
    std::istringstream brood(colon == std::string::npos ? "" : text.substr(colon + 1));
    Line line{{}, UnionState::married, {}};
    std::string one;
    std::string sign;
    std::string other;
    couple >> one >> sign >> other;
    line.state = sign == "~"   ? UnionState::unmarried
                 : sign == "|" ? UnionState::divorced
                               : UnionState::married;
    line.partners = {memberOf(one, Sex::male), memberOf(other, Sex::female)};
    for (std::string child; brood >> child;) line.children.push_back(memberOf(child, Sex::unknown));
    return line;
}

}  // namespace

KinFamily::KinFamily(std::initializer_list<const char*> lines) {
    KinGraphBuilder builder;
    std::vector<Line> read;
    std::map<std::string, Sex> sexes;
    std::vector<std::string> order;
    for (const char* text : lines) {
        read.push_back(lineOf(text));
        const auto note = [&sexes, &order](const Member& member) {
            if (member.name == "?") return;
            const auto [found, isNew] = sexes.emplace(member.name, member.sex);
            if (isNew) order.push_back(member.name);
            if (found->second == Sex::unknown) found->second = member.sex;
        };
        for (const Member& member : read.back().partners) note(member);
        for (const Member& member : read.back().children) note(member);
    }
    for (const std::string& name : order)
        places_[name] = builder.addPerson(static_cast<std::int64_t>(places_.size()) + 1, sexes[name]);
    for (const Line& line : read) {
        const auto place = [this](const Member& member) {
            return member.name == "?" ? kNobody : places_.at(member.name);
        };
        const UnionPlace u = builder.addUnion(place(line.partners[0]), place(line.partners[1]), line.state);
        for (const Member& child : line.children) builder.addChild(u, place(child), child.kind);
    }
    graph_ = builder.build();
}
