/* SPDX-FileCopyrightText: The Olvane developers */
/* SPDX-License-Identifier: MIT */

#pragma once

/*
 * Olvane in C: which relatives of a person a family tree shows, and where each box and line stands.
 *
 * A host fills an olvane_host with eight callbacks, asks for a layout, reads text or records, and frees it:
 *
 *     olvane_layout *layout = NULL;
 *     olvane_status status = olvane_layout_family(&host, 17, NULL, &layout);
 *     if (status == OLVANE_OK) draw(layout);
 *     olvane_layout_free(layout);
 *
 * Ownership: a layout belongs to the caller. Texts and records that it hands out belong to the
 *     layout and live as long as it does. Everything that the host passes in stays the host's; nothing of it
 *     is kept.
 * Threads: layouts may run on several threads at once if their hosts' data can be read so. Callbacks run on
 *     the thread that asked. A layout never changes, so several threads may read one.
 * Failures: every call returns its status; nothing is thrown, printed or aborted.
 */

#include <stddef.h>
#include <stdint.h>

/* The version of this header; olvane_version says that of the library. */
#define OLVANE_VERSION_MAJOR 0
#define OLVANE_VERSION_MINOR 1
#define OLVANE_VERSION_PATCH 0

#if defined(__GNUC__)
#define OLVANE_C_API __attribute__((visibility("default")))
#else
#define OLVANE_C_API
#endif

#ifdef __cplusplus
extern "C" {
#endif

/* Numbers and meanings never change; later versions may add some. */
typedef enum olvane_status {
    OLVANE_OK = 0,
    OLVANE_INVALID_ARGUMENT = 1, /* a null pointer, a missing callback, or an option out of its range */
    OLVANE_INVALID_PERSON = 2,   /* the focus's id is not 1 to 2147483647 */
    OLVANE_HOST_FAILED = 3,      /* a callback reported failure; the layout holds what came before */
    OLVANE_LAYOUT_FAILED = 4,    /* the data leave no picture */
    OLVANE_OUT_OF_MEMORY = 5,
    OLVANE_NESTED_CALL = 6, /* asked for by a callback of a layout that is still running on this thread */
    OLVANE_REFUSED = 7,     /* rows of a family are wrong; nothing has changed, and the error says where */
    OLVANE_INVALID_ID =
        8, /* a callback answered an id that is not 1 to 2147483647; the layout holds what came before */
    OLVANE_UNREADABLE = 9 /* a file cannot be opened, or is not GEDCOM */
} olvane_status;

/* A sentence in English for every status, and for any other number one that says so. Valid until the program ends. */
OLVANE_C_API const char* olvane_status_text(olvane_status status);

/* "MAJOR.MINOR.PATCH" of the library that is loaded. Valid until the program ends. */
OLVANE_C_API const char* olvane_version(void);

/* ---- The host's data ----------------------------------------------------------------------------------- */

/* The answer for a parent whom the host does not know. 0 and -1 are not. */
#define OLVANE_PERSON_NOT_FOUND INT64_MAX

/* Answers of a callback that are no plain numbers. Both start empty and live only within the callback. */
typedef struct olvane_person_list olvane_person_list;
typedef struct olvane_date olvane_date;

/* Copies the ids behind those that the list already holds. ids may be null where count is 0. */
OLVANE_C_API olvane_status olvane_person_list_append(olvane_person_list* list, const int64_t* ids,
                                                     size_t count);

/* Copies the text: UTF-8, ended by a zero byte, in a form of the host's choosing. Null is the empty text. */
OLVANE_C_API olvane_status olvane_date_set(olvane_date* date, const char* text);

/*
 * The host's data source: eight questions about persons.
 *
 * Units: ids are the host's own, 1 to 2147483647.
 * Nobody: an unknown parent is OLVANE_PERSON_NOT_FOUND, and lists hold known persons alone. Any other number
 *     ends the layout with OLVANE_INVALID_ID, and olvane_layout_failure names it.
 * Holds: struct_size is set, else OLVANE_INVALID_ARGUMENT. All eight are set. They are asked many times for the same person, since no answer is kept, and must
 *     agree with themselves within one layout. They may contradict each other: the layout takes them as answered.
 * Fails: a callback returns 0, or any other number to report a failure. The layout then ends with what it
 *     has, with OLVANE_HOST_FAILED, and keeps the number for olvane_layout_host_code. A C++ callback that
 *     throws has failed with the number -1, and nothing distinguishes it from one that returned -1. A callback must
 *     not leave by longjmp. Where the list or the date of a callback has found no memory, the layout ends with
 *     OLVANE_OUT_OF_MEMORY, whatever the callback returns.
 */
typedef struct olvane_host {
    size_t struct_size; /* sizeof(olvane_host), set by the host: a later version may have more callbacks */
    void* context;      /* handed to every callback, and otherwise left alone */

    /* *parent is OLVANE_PERSON_NOT_FOUND when the callback begins. */
    int (*father_of)(void* context, int64_t person, int64_t* parent);
    int (*mother_of)(void* context, int64_t person, int64_t* parent);
    /* The order of this list is the order of drawing. */
    int (*spouses_of)(void* context, int64_t person, olvane_person_list* spouses);
    int (*children_of)(void* context, int64_t person, olvane_person_list* children);
    /* Whether spouse is the preferred one of person. *preferred and *dead are 0 when the callback begins. */
    int (*is_preferred_spouse)(void* context, int64_t person, int64_t spouse, int* preferred);
    int (*is_dead)(void* context, int64_t person, int* dead);
    /* is_birth is 1 for the date of birth, asked of children, and 0 for another date, asked of spouses. */
    int (*date_of)(void* context, int64_t person, int is_birth, olvane_date* date);
    /* 0, which stands there when the callback begins, is male; any other number counts as female. */
    int (*sex_of)(void* context, int64_t person, int32_t* sex);
} olvane_host;

/* ---- Options ------------------------------------------------------------------------------------------- */

/* Relatives that a family view shows. */
#define OLVANE_SHOW_AUNTS_UNCLES 0x01u
#define OLVANE_SHOW_COUSINS 0x02u /* needs aunts and uncles */
#define OLVANE_SHOW_SIBLINGS 0x04u
#define OLVANE_SHOW_SIBLING_SPOUSES 0x08u
#define OLVANE_SHOW_NIECES_NEPHEWS 0x10u
#define OLVANE_SHOW_GRANDCHILDREN 0x20u
#define OLVANE_SHOW_GREAT_GRANDPARENTS 0x40u
#define OLVANE_SHOW_SPOUSES_OF_CHILDREN 0x80u
#define OLVANE_SHOW_ALL 0xFFu

/* A pedigree takes a few hundred bytes of stack for each generation: 1000 need half a megabyte of stack. */
#define OLVANE_MOST_GENERATIONS 1000

/* The sizes of the drawing, in points. All are finite, else OLVANE_INVALID_ARGUMENT. Nothing more is asked:
   with 0 and negative sizes boxes overlap or run the other way, and a place beyond 32 bits stands at INT32_MAX
   or INT32_MIN. */
typedef struct olvane_sizes {
    float node_width;       /* of one person's box */
    float node_height;      /* of one person's box */
    float horz_padding;     /* gap between boxes of a row */
    float vert_padding;     /* gap between generations */
    float spouse_line_step; /* between the stacked lines of one person's marriages */
    float line_inset;       /* of a marriage line from a box's left edge; read by the pedigree alone */
} olvane_sizes;

typedef struct olvane_options {
    size_t struct_size; /* sizeof(olvane_options); olvane_options_default sets it */
    olvane_sizes sizes;
    uint32_t shown; /* Family view: OLVANE_SHOW_ bits. */
    /* Pedigree: columns, the focus's own included; 1 to OLVANE_MOST_GENERATIONS. Full ancestry of n is 2^n - 1
       boxes, and nothing but memory ends that: a circle of parents fills all columns. */
    int32_t generations;
    /* Pedigree: generations, the focus's own included, in which a parent's partners who are off the chart
       raise the flag; 0 for none. */
    int32_t flag_depth;
} olvane_options;

/* Boxes of 55 by 80 with gaps of 25 and 30, marriage lines 10 apart, no inset; everybody shown; 5
   generations, flags in 4. */
OLVANE_C_API olvane_status olvane_options_default(olvane_options* options);

/* ---- Layouts ------------------------------------------------------------------------------------------- */

typedef struct olvane_layout olvane_layout;

/*
 * The family view: the focus with spouses, siblings, descendants below and ancestors above; and the pedigree:
 * a sideways chart of ancestors. options may be null for the defaults.
 *
 * *layout is set by every call: to null after OLVANE_INVALID_ARGUMENT and OLVANE_NESTED_CALL, and perhaps
 * after OLVANE_OUT_OF_MEMORY; else to a layout that the caller frees, which after a failure holds what was
 * laid out so far, often nothing.
 */
OLVANE_C_API olvane_status olvane_layout_family(const olvane_host* host, int64_t focus,
                                                const olvane_options* options, olvane_layout** layout);
OLVANE_C_API olvane_status olvane_layout_pedigree(const olvane_host* host, int64_t focus,
                                                  const olvane_options* options, olvane_layout** layout);

/* A null layout is allowed. */
OLVANE_C_API void olvane_layout_free(olvane_layout* layout);

/* The result text, ended by a zero byte that length does not count. length may be null. After a failure the
   last record of the text may be cut anywhere. */
OLVANE_C_API olvane_status olvane_layout_text(const olvane_layout* layout, const char** text, size_t* length);

/* A straight piece of a line, in points. */
typedef struct olvane_segment {
    int32_t x1;
    int32_t y1;
    int32_t x2;
    int32_t y2;
} olvane_segment;

/* Whether a record is of a person whom the host knows. */
typedef enum olvane_record_kind {
    OLVANE_PERSON = 0,
    OLVANE_MISSING_FATHER = 1, /* an unknown parent: an empty box where the host knows no father */
    OLVANE_MISSING_MOTHER = 2
} olvane_record_kind;

/*
 * One box, and the lines that hang from it.
 *
 * Units: points, whole; x grows right, y grows down. (x, y) is the upper-left corner; the size is that of the
 *     options.
 * Holds: the id of an unknown parent is negative, and child is then the person whose parent is unknown, else 0. One
 *     person may stand in several boxes. Segments may repeat; segments is null where there are none.
 */
typedef struct olvane_record {
    int64_t id;
    int32_t x;
    int32_t y;
    int32_t has_hidden_relatives; /* 1 for a person who has relatives without a box */
    olvane_record_kind kind;
    int64_t child;
    const olvane_segment* segments;
    size_t segment_count;
} olvane_record;

/* All whole records in the order of the text; *records is null where there are none. */
OLVANE_C_API olvane_status olvane_layout_records(const olvane_layout* layout, const olvane_record** records,
                                                 size_t* count);

/* The number with which a callback failed, and 0 where none did. */
OLVANE_C_API olvane_status olvane_layout_host_code(const olvane_layout* layout, int* code);

/* After OLVANE_HOST_FAILED and OLVANE_INVALID_ID: the callback, the person and what was wrong, in English, as in
   "spouses_of(17) returned 5". Else the empty text. */
OLVANE_C_API olvane_status olvane_layout_failure(const olvane_layout* layout, const char** text);

#ifdef __cplusplus
}
#endif
