/* SPDX-FileCopyrightText: The Olvane developers */
/* SPDX-License-Identifier: MIT */

#pragma once

/*
 * A layout as a picture: boxes, the families that join them, and lines that are routed around all boxes, as plain
 * arrays.
 *
 *     olvane_picture *picture = NULL;
 *     olvane_picture_arrays arrays = {sizeof arrays};
 *     olvane_picture_create(layout, family, 1, &picture);
 *     olvane_picture_read(picture, &arrays);
 *     for (size_t i = 0; i < arrays.line_count; ++i) draw(&arrays.lines[i]);
 *     olvane_picture_free(picture);
 *
 * Units: points; x grows right, y grows down. Places in an array count from 0, and OLVANE_NO_PLACE is nowhere.
 * Ownership: a picture belongs to the caller and needs neither the layout nor the family any more. Its arrays
 *     live as long as it does.
 * Threads: a picture never changes, so several threads may read one.
 */

#include <olvane.h>
#include <olvane_family.h>
#include <olvane_file.h>

#ifdef __cplusplus
extern "C" {
#endif

#define OLVANE_NO_PLACE (-1)

/* The numbers of these enumerations never change; later versions may add some. */
typedef enum olvane_box_kind { OLVANE_BOX_PERSON = 0, OLVANE_BOX_UNKNOWN_PARENT = 1 } olvane_box_kind;

typedef enum olvane_line_role {
    OLVANE_LINE_MARRIAGE = 0, /* from parent to parent */
    OLVANE_LINE_DROP = 1,     /* from the parents to the bar */
    OLVANE_LINE_BAR = 2,      /* along the children */
    OLVANE_LINE_STEM = 3,     /* to one child */
    OLVANE_LINE_LINK = 4      /* where there are no levels */
} olvane_line_role;

typedef enum olvane_mark_kind {
    OLVANE_MARK_SAME_PERSON = 0, /* two boxes of one person */
    OLVANE_MARK_PARENTS_ELSEWHERE =
        1, /* a child, and the one or two parents whose family is drawn elsewhere */
    OLVANE_MARK_PARTNERS_ELSEWHERE = 2
} olvane_mark_kind;

/* repeat is 0 for a person with one box; else it counts the person's boxes from 1, the nearest to the focus first. */
typedef struct olvane_picture_box {
    int64_t id; /* 0 for an unknown parent */
    double x;   /* of the upper-left corner */
    double y;
    float width;
    float height;
    int32_t kind;     /* olvane_box_kind */
    int32_t sex;      /* 0 male, 1 female, 2 unknown */
    int32_t child_of; /* of an unknown parent: the box whose parent it is */
    int32_t repeat;
    int32_t flag;           /* 1 for a person who has relatives without a box, by the layout's own count */
    int32_t hidden_parents; /* relatives without a box; 0 where no family was given */
    int32_t hidden_partners;
    int32_t hidden_children;
    int32_t
        further_parents; /* families that the person is a child of, beside the first, with no parent shown */
    int32_t living;      /* 1 for a person of whom nothing is to be stated, where hide_living was asked for */
} olvane_picture_box;

/* Persons joined by lines. Its members lie side by side in members, one or two parents first, the father or the
   husband ahead, then the children; child_kinds lies beside members. */
typedef struct olvane_picture_family {
    uint32_t first_member;
    uint32_t parent_count;
    uint32_t child_count;
    uint32_t first_line; /* in lines */
    uint32_t line_count;
    uint32_t number; /* of the family in olvane_family; 0 without one */
    int32_t state;   /* 0 married, 1 divorced, 2 unmarried, 3 unknown */
} olvane_picture_family;

/* A straight piece, horizontal or vertical. Its bridges are where it jumps over another family's line: the x of each on
   a horizontal piece, the y on a vertical one. */
typedef struct olvane_picture_line {
    double x1;
    double y1;
    double x2;
    double y2;
    int32_t role;          /* olvane_line_role */
    int32_t child;         /* the box of the child to whom the piece belongs alone, or OLVANE_NO_PLACE */
    uint32_t first_bridge; /* in bridges */
    uint32_t bridge_count;
} olvane_picture_line;

/* What is expressed without a line. Marks of one number, from 1, have one sign at each of their boxes. */
typedef struct olvane_picture_mark {
    int32_t kind; /* olvane_mark_kind */
    int32_t number;
    int32_t boxes[3]; /* OLVANE_NO_PLACE where there are fewer */
} olvane_picture_mark;

/* A box of a round chart, beside the box: a piece of a ring, in degrees clockwise from the top. Ring 0 is the middle. */
typedef struct olvane_picture_arc {
    double from;
    double to;
    int32_t ring;
    int32_t line; /* the box at which its line of descent begins, or OLVANE_NO_PLACE */
} olvane_picture_arc;

/* A way between two persons, in a picture of kinship. Its boxes, from the focus to the other person, and behind them the
   common ancestors at its top, lie in way_boxes; its line, in way_pieces, runs along the lines of families. */
typedef struct olvane_picture_way {
    uint32_t first_box;
    uint32_t box_count;
    uint32_t ancestor_count;
    uint32_t first_piece;
    uint32_t piece_count;
    int32_t kind;      /* 0 by blood, 1 by adoption, fostering or similar, 2 by marriage */
    const char* words; /* what the other person is to the focus by this way alone */
} olvane_picture_way;

typedef struct olvane_picture_piece {
    double x1;
    double y1;
    double x2;
    double y2;
} olvane_picture_piece;

/* A branch that is left out: count persons would have boxes with it, on that side of the box. */
typedef struct olvane_picture_folded {
    int32_t box;
    int32_t count;
    int32_t branch; /* of olvane_fold */
    int32_t side;   /* 0 top, 1 right, 2 bottom, 3 left */
} olvane_picture_folded;

/* All arrays of a picture; those of no entries are null. */
typedef struct olvane_picture_arrays {
    size_t
        struct_size; /* sizeof(olvane_picture_arrays), set by the caller: a later version fills what it knows */
    const olvane_picture_box* boxes; /* in the order of the layout's records */
    size_t box_count;
    const olvane_picture_family* families;
    size_t family_count;
    const int32_t* members; /* places of boxes */
    const int32_t*
        child_kinds;     /* 0 birth, 1 adopted, 2 foster, 3 step, 4 sealing, 5 unknown; nothing at a parent */
    size_t member_count; /* of both */
    const olvane_picture_line* lines;
    size_t line_count;
    const double* bridges;
    size_t bridge_count;
    const olvane_picture_mark* marks;
    size_t mark_count;
    int32_t focus;                  /* place of its box, or OLVANE_NO_PLACE in an empty picture */
    int32_t other;                  /* the other person's box in a picture of kinship, or OLVANE_NO_PLACE */
    const olvane_picture_arc* arcs; /* one for each box of a round chart */
    size_t arc_count;
    const double* ring_radii; /* ring i reaches from ring_radii[i] to ring_radii[i + 1] */
    size_t ring_radius_count;
    double middle_x;
    double middle_y;
    const olvane_picture_way* ways; /* those by blood first, the nearest first */
    size_t way_count;
    const int32_t* way_boxes;
    size_t way_box_count;
    const olvane_picture_piece* way_pieces;
    size_t way_piece_count;
    const char* focus_is; /* what the focus is to the other person, in words; empty without a way */
    const char* other_is;
    const olvane_picture_folded* folded;
    size_t folded_count;
} olvane_picture_arrays;

typedef struct olvane_picture olvane_picture;

/*
 * The picture of a layout, also of what a failed one holds. With the family of which the layout is, families of the
 * picture have its numbers, states and kinds of children, and boxes their counts of hidden relatives; family may be
 * null. unknown_parents is 0 to leave out the boxes of parents who are not known.
 */
OLVANE_C_API olvane_status olvane_picture_create(const olvane_layout* layout, const olvane_family* family,
                                                 int unknown_parents, olvane_picture** picture);
/* ---- Any view in one call ------------------------------------------------------------------------------------ */

typedef enum olvane_picture_view {
    OLVANE_PICTURE_FAMILY = 0,
    OLVANE_PICTURE_PEDIGREE = 1,
    OLVANE_PICTURE_NEAR = 2, /* the persons of the family view, placed compactly */
    OLVANE_PICTURE_ANCESTORS = 3,
    OLVANE_PICTURE_DESCENDANTS = 4,
    OLVANE_PICTURE_HOURGLASS = 5,
    OLVANE_PICTURE_RELATIVES = 6,
    OLVANE_PICTURE_FAN = 7,
    OLVANE_PICTURE_KINSHIP = 8,
    OLVANE_PICTURE_EVERYBODY = 9
} olvane_picture_view;

/* A branch of a person that is left out: everybody to whom only it leads. */
typedef struct olvane_fold {
    int64_t person;
    int32_t
        branch; /* 0 ancestors, 1 descendants, 2 partners and, of the focus and its ancestors, siblings with theirs */
} olvane_fold;

/* A person whose box has a size of its own, in points, as it stands on paper: not turned when a chart runs sideways. */
typedef struct olvane_box_size {
    int64_t person;
    float width;  /* 0 to a million */
    float height; /* likewise */
} olvane_box_size;

/* What a view has no use for is ignored. */
typedef struct olvane_picture_options {
    size_t struct_size;      /* sizeof(olvane_picture_options); olvane_picture_options_default sets it */
    int32_t view;            /* olvane_picture_view */
    int32_t up;              /* generations of ancestors; 0 for all */
    int32_t down;            /* generations of descendants; 0 for all */
    int32_t direction;       /* where later generations stand: 0 below, 1 above, 2 left, 3 right */
    int32_t spouses;         /* of descendants: 1 */
    int32_t siblings;        /* of ancestors: 0 */
    int32_t compact;         /* 1 for trees packed tighter */
    int32_t fan_of;          /* 0 ancestors, 1 descendants */
    double fan_angle;        /* 90 to 360 degrees */
    int64_t other;           /* kinship: the other person */
    int32_t ways;            /* kinship: 0 by blood, 1 by marriage, 2 both */
    int32_t most_ways;       /* kinship: 8; 0 for all */
    int32_t language;        /* kinship: 0 English, 1 German, 2 Spanish */
    int32_t marks;           /* everybody: how many second links become marks; -1 for all */
    int32_t effort;          /* everybody: 0 to 100 */
    int32_t all_parts;       /* everybody: 1 for those as well who are not connected with the focus */
    int32_t unknown_parents; /* family, pedigree: 1 for boxes of parents who are not known */
    int32_t hide_living;     /* of a file: 1 to hide everyone who may be living, and to mark their boxes */
    int32_t year;            /* the year that hide_living counts from; 0 for the present one */
    int32_t mirrored;        /* 1 for right and left exchanged */
    const olvane_fold*
        folds; /* near, ancestors, descendants, hourglass, relatives; may be null without any */
    size_t fold_count;
    olvane_options
        layout; /* the box and the gaps of every view; family, near: shown; pedigree: generations */
    /* Everybody: an earlier picture of everybody, or null. It is read during the call only. Who is in both, by id,
       stays where that picture has them as far as the change allows; it is not looked at if it is of another view or
       direction, or if less than half of the family is in it. */
    const olvane_picture* earlier;
    /* Near, ancestors, descendants, hourglass, relatives, kinship, everybody: whose boxes are not of the size that layout
       has; may be null without any. Who is not in the family is passed over, and the last of two sizes for one person
       counts. They are read during the call only. */
    const olvane_box_size* box_sizes;
    size_t box_size_count;
    /* Everybody, near, ancestors, descendants, hourglass, relatives: width by height of the paper that wide generations
       are folded for; 0 for none. */
    double aspect;
} olvane_picture_options;

/* Everything at its usual value, as said above, for the view. */
OLVANE_C_API olvane_status olvane_picture_options_default(int32_t view, olvane_picture_options* options);

/* OLVANE_INVALID_ARGUMENT where a field is out of its range, and then *refused is the name of the first such field, as
   "fan_angle" or "layout.generations"; else *refused is null. The name is never released. */
OLVANE_C_API olvane_status olvane_picture_options_check(const olvane_picture_options* options,
                                                        const char** refused);

typedef enum olvane_option_kind {
    OLVANE_OPTION_WORD = 0, /* the number of one of its words */
    OLVANE_OPTION_FLAG = 1, /* 0 for no, anything else for yes */
    OLVANE_OPTION_WHOLE = 2,
    OLVANE_OPTION_NUMBER = 3
} olvane_option_kind;

/* What a field of olvane_picture_options takes, for programs that offer the options to a user. */
typedef struct olvane_picture_option {
    size_t struct_size; /* sizeof(olvane_picture_option), set by the caller */
    const char* name;   /* of the field; never released */
    int32_t kind;       /* olvane_option_kind */
    uint32_t views;     /* that it changes: a bit for each olvane_picture_view, the first the lowest */
    double least;
    double most;
    double usual;
} olvane_picture_option;

/* Options count from 0. OLVANE_INVALID_ARGUMENT beyond the last one, and for a struct_size of no version. */
OLVANE_C_API size_t olvane_picture_option_count(void);
OLVANE_C_API olvane_status olvane_picture_option_at(size_t index, olvane_picture_option* option);

/* The word of that number, of an option that takes words; null where there is none. It is never released. */
OLVANE_C_API const char* olvane_picture_option_word(size_t index, size_t word);

/*
 * The picture of a view, of a table or of a host that is asked as far as the view reaches. options may be null for the
 * family view. *picture is set by every call: to null after OLVANE_INVALID_ARGUMENT and OLVANE_NESTED_CALL, and perhaps
 * after OLVANE_OUT_OF_MEMORY; else to a picture that the caller frees, which after a failure is empty.
 */
OLVANE_C_API olvane_status olvane_picture_of_family(const olvane_family* family, int64_t focus,
                                                    const olvane_picture_options* options,
                                                    olvane_picture** picture);
OLVANE_C_API olvane_status olvane_picture_of_host(const olvane_host* host, int64_t focus,
                                                  const olvane_picture_options* options,
                                                  olvane_picture** picture);

/* The same of an open file. OLVANE_INVALID_PERSON for a focus or another person who is not in it. */
OLVANE_C_API olvane_status olvane_picture_of_file(const olvane_file* file, int64_t focus,
                                                  const olvane_picture_options* options,
                                                  olvane_picture** picture);

/* After a failure, what went wrong, in English: "spouses_of(17) returned 5". Else the empty text. */
OLVANE_C_API olvane_status olvane_picture_failure(const olvane_picture* picture, const char** text);

/* A null picture is allowed. */
OLVANE_C_API void olvane_picture_free(olvane_picture* picture);

/* OLVANE_INVALID_ARGUMENT for a struct_size of no version. */
OLVANE_C_API olvane_status olvane_picture_read(const olvane_picture* picture, olvane_picture_arrays* arrays);

/* The picture as JSON of format 2, ended by a zero byte that length does not count; it lives as long as the picture.
   length may be null. */
OLVANE_C_API olvane_status olvane_picture_json(const olvane_picture* picture, const char** text,
                                               size_t* length);

/* What is counted in a picture, and what it measures; docs/judge.md defines each count. Widths and heights are in points, areas
   in boxes of mean size for each person, line lengths in mean box widths. */
typedef struct olvane_judgement {
    size_t struct_size; /* sizeof(olvane_judgement), set by the caller */
    int64_t boxes;
    int64_t persons; /* with one box or more */
    int64_t families;
    int64_t overlaps;  /* pairs of boxes */
    int64_t hits;      /* pairs of a family and somebody else's box that a line runs through */
    int64_t crossings; /* pairs of families, and so are tracks and touches */
    int64_t tracks;
    int64_t touches;
    int64_t unjoined; /* members whom their family's lines do not reach */
    int64_t untold;   /* known relations that nothing expresses; -1 where no family was given */
    int64_t couples;
    int64_t side_by_side;
    int64_t repeats;  /* persons with more than one box */
    int64_t unmarked; /* those of them of whom a box has no mark */
    int64_t slanted;
    int64_t same_person_marks;
    int64_t parents_elsewhere_marks;
    int64_t partners_elsewhere_marks;
    double width;
    double height;
    double area_per_person;
    double aspect; /* width to height; 0 for a picture without height */
    double median_line_length;
    double long_line_length; /* the 95th percentile */
} olvane_judgement;

/*
 * Counts everything that can be counted in one picture. family says who is related to whom, by the same ids, for untold; it
 * may be null. OLVANE_INVALID_ARGUMENT for a struct_size of no version.
 */
OLVANE_C_API olvane_status olvane_picture_judge(const olvane_picture* picture, const olvane_family* family,
                                                olvane_judgement* judgement);

#ifdef __cplusplus
}
#endif
