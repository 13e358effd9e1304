// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <limits>
#include <string>
#include <vector>

// Takes the entries of a host's list one by one: a reference to a callable, which must outlive it.
class PersonIdVisitor {
public:
    template <class Visit>
    explicit PersonIdVisitor(const Visit& visit)
        : visit_(&visit), call_([](const void* callable, std::int64_t person) {
              (*static_cast<const Visit*>(callable))(person);
          }) {}

    void operator()(std::int64_t person) const { call_(visit_, person); }

private:
    const void* visit_;
    void (*call_)(const void*, std::int64_t);
};

// The host's data source: eight questions about persons. All that the engine knows of a family comes through
// these.
//
// Units: person ids are the host's own. Real persons have ids of 1 and more; ids below 1 mark unknown
//        parents inside the engine. Only the low 32 bits of an id count.
// Holds: asked on the caller's thread, within a layout, and many times for the same person, since no answer
//        is kept. Answers must agree with each other within one layout. They may contradict each other
//        otherwise (a child that does not name its parent, a person who is their own ancestor): the layout
//        takes them as answered.
// Fails: an operation may throw anything. The layout then ends with the text written so far.
class OlvaneViewerManagerWrapProtocol {
public:
    // The answer of fatherForPersonWithID and motherForPersonWithID for a parent who is not known.
    static constexpr std::int64_t kPersonNotFound = std::numeric_limits<std::int64_t>::max();

    OlvaneViewerManagerWrapProtocol() = default;
    OlvaneViewerManagerWrapProtocol(const OlvaneViewerManagerWrapProtocol&) = default;
    OlvaneViewerManagerWrapProtocol& operator=(const OlvaneViewerManagerWrapProtocol&) = default;
    virtual ~OlvaneViewerManagerWrapProtocol() = default;

    virtual std::int64_t fatherForPersonWithID(std::int64_t personId) = 0;
    virtual std::int64_t motherForPersonWithID(std::int64_t personId) = 0;
    // The order of this list is the order of drawing. A spouse listed twice is drawn twice, with all
    // children.
    virtual std::vector<std::int64_t> spousesForPersonWithID(std::int64_t personId) = 0;
    virtual std::vector<std::int64_t> childrenForPersonWithID(std::int64_t personId) = 0;
    virtual bool isPreferredSpouse(std::int64_t personId, std::int64_t spouseId) = 0;
    virtual bool isPersonDead(std::int64_t personId) = 0;
    // UTF-8, in a form of the host's choosing. Asked with true for children and with false for spouses; the
    // engine compares no more than the first character.
    virtual std::string dateForPersonWithID(std::int64_t personId, bool isBirth) = 0;
    // 0 for male; any other number counts as female.
    virtual std::int32_t sexOfPersonWithID(std::int64_t personId) = 0;

    // How the engine reads the two lists: the questions about an entry come before the next entry is read. A
    // data source whose own lists may change while they are read overrides these; for others the whole list is
    // there before the first question.
    virtual void visitSpousesOfPerson(std::int64_t personId, const PersonIdVisitor& visit) {
        for (const std::int64_t spouse : spousesForPersonWithID(personId)) visit(spouse);
    }
    virtual void visitChildrenOfPerson(std::int64_t personId, const PersonIdVisitor& visit) {
        for (const std::int64_t child : childrenForPersonWithID(personId)) visit(child);
    }
};
