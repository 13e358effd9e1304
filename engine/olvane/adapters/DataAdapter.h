// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <boost/function.hpp>

#include <utility>

#include <olvane/adapters/ChildrenAdapter.h>
#include <olvane/adapters/SpouseAdapter.h>

// The six callbacks through which a layouter learns of a family. Persons are known by key alone.
//
// A plain holder: it copies the callbacks and keeps no answers. It must outlive the layouter that points to it.
// Fails: calling a field that was left empty throws boost::bad_function_call ("call to empty
//        boost::function"); whatever a callback throws passes through the layouter unchanged.
struct DataAdapter {
    typedef olvane::RecordsCallback<SpouseAdapter> SpousesCallback;  // also of std::set<SpouseAdapter>
    typedef boost::function<void(int, int&, int&)> ParentsCallback;
    typedef olvane::RecordsCallback<ChildrenAdapter> ChildrenCallback;
    typedef boost::function<bool(int)> KeyTest;
    typedef boost::function<void(int)> KeyTouch;

    SpousesCallback getSpouses;    // (key, set): adds the person's spouses
    ParentsCallback getParents;    // (key, father, mother): writes the keys of the parents that there are
    ChildrenCallback getChildren;  // (key, set): adds the person's children
    KeyTest isMale;                // true for male
    KeyTest isAddNode;             // an unknown parent, or a key below 0
    KeyTouch touchPerson;          // fails on a key never handed out, does nothing else

    DataAdapter(SpousesCallback spouses, ParentsCallback parents, ChildrenCallback children, KeyTest male,
                KeyTest addNode, KeyTouch touch)
        : getSpouses(std::move(spouses)),
          getParents(std::move(parents)),
          getChildren(std::move(children)),
          isMale(std::move(male)),
          isAddNode(std::move(addNode)),
          touchPerson(std::move(touch)) {}
};
