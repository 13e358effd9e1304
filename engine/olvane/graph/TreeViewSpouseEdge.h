// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <boost/shared_ptr.hpp>

#include <cstddef>
#include <new>
#include <vector>

#include <olvane/Export.h>
#include <olvane/detail/RefCountedSlabs.h>
#include <olvane/graph/TreeViewEdge.h>
#include <olvane/graph/TreeViewGenerationEdge.h>

class TreeViewPerson;

// The edge between two partners, with the edges of the children that hang from the couple. In a couple of a
// man and a woman, person is the man and spouse the woman. Owned by one person's spouseEdges; both persons
// are pointed to, not owned.
class OLVANE_API TreeViewSpouseEdge : public TreeViewEdge {
public:
    typedef std::vector<boost::shared_ptr<TreeViewGenerationEdge>> ChildEdges;
    typedef std::vector<TreeViewGenerationEdge*> ChildEdgeList;

    TreeViewSpouseEdge(TreeViewPerson* first, TreeViewPerson* second);
    TreeViewSpouseEdge(TreeLine line, TreeViewPerson* first, TreeViewPerson* second);
    TreeViewSpouseEdge(TreeLine line, TreeViewPerson* first, TreeViewPerson* second, ChildEdges edges);
    ~TreeViewSpouseEdge() override;

    void addChildEdge(boost::shared_ptr<TreeViewGenerationEdge> edge);
    // Room for the first ones, where their number is known.
    void reserveChildEdges(std::size_t count) {
        if (childEdges.capacity() == 0) childEdges.reserve(count);
    }

    // Appends, whatever the position: exactly what addChildEdge does. Hosts number a couple's children by
    // this list, and an honoured position would renumber those already handed out.
    void insertChildEdge(const boost::shared_ptr<TreeViewGenerationEdge>& edge,
                         ChildEdges::const_iterator position);

    std::size_t size() const { return childEdges.size(); }

    // A walk over plain pointers. begin and cbegin take the view again; end and cend give the end of the view
    // as it stands, so begin is asked first and end after it.
    ChildEdgeList::iterator begin();
    ChildEdgeList::iterator end() { return childEdgeList.end(); }
    ChildEdgeList::const_iterator cbegin() const;
    ChildEdgeList::const_iterator cend() const { return childEdgeList.cend(); }

    // A walk over the shared pointers themselves.
    ChildEdges::iterator sbegin() { return childEdges.begin(); }
    ChildEdges::iterator send() { return childEdges.end(); }
    ChildEdges::const_iterator csbegin() const { return childEdges.cbegin(); }
    ChildEdges::const_iterator csend() const { return childEdges.cend(); }

    bool isSpouseMale() const;  // the gender of the second partner

    // An edge lies on a slab, or on the heap where none is given; it is deleted in the same way. The forms with a
    // place are for callers who make an edge in memory of their own.
    static void* operator new(std::size_t bytes) { return olvane::RefCountedSlabs::allocateSingle(bytes); }
    static void* operator new(std::size_t bytes, const std::nothrow_t&) noexcept {
        try {
            return olvane::RefCountedSlabs::allocateSingle(bytes);
        } catch (...) {
            return nullptr;
        }
    }
    static void* operator new(std::size_t bytes, olvane::RefCountedSlabs& slabs) {
        return slabs.allocate(bytes);
    }
    static void* operator new(std::size_t, void* place) { return place; }
    static void operator delete(void* edge) { olvane::RefCountedSlabs::deallocate(edge); }
    static void operator delete(void* edge, const std::nothrow_t&) {
        olvane::RefCountedSlabs::deallocate(edge);
    }
    static void operator delete(void* edge, olvane::RefCountedSlabs&) {
        olvane::RefCountedSlabs::deallocate(edge);
    }
    static void operator delete(void*, void*) {}

    ChildEdges childEdges;
    mutable ChildEdgeList childEdgeList;  // the plain view, rebuilt by begin and cbegin
    TreeViewPerson* person;
    TreeViewPerson* spouse;

private:
    void rebuildChildEdgeList() const;
};
