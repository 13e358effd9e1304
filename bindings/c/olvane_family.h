/* SPDX-FileCopyrightText: The Olvane developers */
/* SPDX-License-Identifier: MIT */

#pragma once

/*
 * A family handed over once: a table of persons, lists of spouses and children, families, names and fields. Layouts of
 * it need no callbacks.
 *
 *     olvane_family_columns columns = {0};
 *     columns.persons.id = (olvane_numbers){ids, 4, OLVANE_INT64};
 *     columns.persons.father = (olvane_numbers){fathers, 4, OLVANE_INT64};
 *     ...
 *     olvane_family *family = NULL;
 *     olvane_family_error error;
 *     if (olvane_family_create(&columns, &family, &error) != OLVANE_OK) puts(error.message);
 *     olvane_view(family, OLVANE_VIEW_FAMILY, 17, NULL, &layout);
 *
 * Ids: of persons and numbers of families are 1 to 2147483647; any other number is refused. 0 is nobody, and so is
 *     OLVANE_PERSON_NOT_FOUND.
 * Texts: are UTF-8 without a zero byte, of up to 1048576 bytes.
 * Ownership: everything that is passed in is copied. Texts and lists that a family gives live until it is changed or
 *     freed.
 * Threads: any number may read a family and lay it out; to change one, nobody else may use it. Copies share their rows
 *     and may be used as if they did not.
 * Failures: what is wrong is refused with OLVANE_REFUSED before anything changes, and the error names it. error may be
 *     null everywhere.
 */

#include <olvane.h>

#ifdef __cplusplus
extern "C" {
#endif

typedef struct olvane_family olvane_family;

/* The rows that an error is about. */
typedef enum olvane_family_table {
    OLVANE_TABLE_PERSONS = 0,
    OLVANE_TABLE_SPOUSES = 1,
    OLVANE_TABLE_CHILDREN = 2,
    OLVANE_TABLE_FAMILIES = 3,
    OLVANE_TABLE_FAMILY_CHILDREN = 4,
    OLVANE_TABLE_NAMES = 5,
    OLVANE_TABLE_FIELDS = 6
} olvane_family_table;

#define OLVANE_NO_ROW SIZE_MAX

/* What was refused. field and message end with a zero byte, and are cut where they do not fit. */
typedef struct olvane_family_error {
    olvane_family_table table;
    size_t row; /* from 0, in the columns; OLVANE_NO_ROW for an edit and for a whole column */
    int64_t id; /* of the person or family of an edit; else 0 */
    char field[32];
    char message[224]; /* such as "persons row 12, field father: 99 is not the id of a person" */
} olvane_family_error;

/* ---- Filling a family in one go -------------------------------------------------------------------------- */

typedef enum olvane_number_type {
    OLVANE_INT8 = 0,
    OLVANE_UINT8 = 1,
    OLVANE_INT32 = 2,
    OLVANE_UINT32 = 3,
    OLVANE_INT64 = 4,
    OLVANE_DOUBLE = 5 /* whole ones */
} olvane_number_type;

/* A column of numbers, one behind the other; null where it is not given. */
typedef struct olvane_numbers {
    const void* data;
    size_t count;
    int32_t type; /* an olvane_number_type; any other number is an invalid argument */
} olvane_numbers;

/* A column of texts in one of three forms; all null where it is not given. */
typedef struct olvane_texts {
    const char* const* texts; /* each ended by a zero byte, or null for the empty text */
    const char* bytes;        /* all, one behind the other: each ended by a zero byte, or without one where */
    const uint32_t* starts;   /* starts says where each begins, and last where the last one ends */
    size_t length;            /* of bytes */
    size_t count;             /* of texts */
} olvane_texts;

/* A family as columns. All columns of one list of rows have the same count; one that is not given stands for its
   default. Fill it with zeros first. */
typedef struct olvane_family_columns {
    struct {
        olvane_numbers id; /* needed */
        olvane_numbers father;
        olvane_numbers mother;
        olvane_numbers sex;         /* 0 male, 1 female, 2 unknown; unknown by default */
        olvane_numbers dead;        /* 0 or 1; 0 by default */
        olvane_texts birth;         /* in a form that sorts by its bytes */
        olvane_texts death;         /* in a form that sorts by its bytes */
        olvane_texts birth_written; /* for people to read; the sorting form by default */
        olvane_texts death_written;
    } persons;
    /* Who is listed as whose spouse, in the order of drawing: one row for each of the two lists that a couple stands
       in. Not given, the lists follow from the families. */
    struct {
        olvane_numbers person;    /* needed */
        olvane_numbers spouse;    /* needed */
        olvane_numbers preferred; /* 1 for at most one row of a person; by default for the first one */
    } spouses;
    /* Who is listed as whose child, in the order of drawing. Not given, the lists follow from the families, then from
       father and mother. */
    struct {
        olvane_numbers parent; /* needed */
        olvane_numbers child;  /* needed */
    } children;
    struct {
        olvane_numbers number;   /* needed */
        olvane_numbers partner0; /* the father or husband */
        olvane_numbers partner1; /* the mother or wife */
        olvane_numbers state;    /* 0 married, 1 divorced, 2 unmarried, 3 unknown; unknown by default */
        olvane_texts marriage;   /* in a form that sorts by its bytes */
        olvane_texts marriage_written;
        olvane_texts marriage_place;
    } families;
    struct {
        olvane_numbers family; /* needed */
        olvane_numbers child;  /* needed */
        olvane_numbers
            kind; /* 0 birth, 1 adopted, 2 foster, 3 step, 4 sealing, 5 unknown; birth by default */
    } family_children;
    /* The parts of a person's names in their order. A full name begins the next one. */
    struct {
        olvane_numbers person; /* needed */
        olvane_numbers
            kind; /* 0 full, 1 given, 2 surname, 3 prefix, 4 suffix, 5 nickname, 6 married, 7 other */
        olvane_texts text; /* needed */
    } names;
    /* Anything else for labels. */
    struct {
        olvane_numbers person; /* needed */
        olvane_texts key;      /* needed, not empty, each once for a person */
        olvane_texts text;     /* needed */
    } fields;
} olvane_family_columns;

/* Null columns make an empty family. *family is null after a failure. */
OLVANE_C_API olvane_status olvane_family_create(const olvane_family_columns* columns, olvane_family** family,
                                                olvane_family_error* error);

/* Shares all rows until one of the two is changed: made in the time of a count, whatever the size. */
OLVANE_C_API olvane_status olvane_family_copy(const olvane_family* family, olvane_family** copy);

/* A null family is allowed. */
OLVANE_C_API void olvane_family_free(olvane_family* family);

/* ---- Changing a family ----------------------------------------------------------------------------------- */

/* A person as one row. Null texts are empty. */
typedef struct olvane_person_row {
    int64_t id;
    int64_t father;
    int64_t mother;
    int32_t sex;
    int32_t dead;
    const char* birth;
    const char* death;
    const char* birth_written;
    const char* death_written;
} olvane_person_row;

typedef struct olvane_family_row {
    int64_t number;
    int64_t partner0;
    int64_t partner1;
    int32_t state;
    const char* marriage;
    const char* marriage_written;
    const char* marriage_place;
} olvane_family_row;

typedef struct olvane_family_child {
    int64_t child;
    int32_t kind;
} olvane_family_child;

typedef struct olvane_name_part {
    int32_t kind;
    const char* text;
} olvane_name_part;

/* The parents that a row names get the person at the end of their lists of children where it is missing; who is no
   longer a parent loses it. Removing a person removes everything that names it, and looks at every row. */
OLVANE_C_API olvane_status olvane_family_add_person(olvane_family* family, const olvane_person_row* row,
                                                    olvane_family_error* error);
OLVANE_C_API olvane_status olvane_family_set_person(olvane_family* family, const olvane_person_row* row,
                                                    olvane_family_error* error);
OLVANE_C_API olvane_status olvane_family_remove_person(olvane_family* family, int64_t id,
                                                       olvane_family_error* error);

/* The list and nothing else. preferred is one of them, or 0 for none. */
OLVANE_C_API olvane_status olvane_family_set_spouses(olvane_family* family, int64_t id,
                                                     const int64_t* spouses, size_t count, int64_t preferred,
                                                     olvane_family_error* error);
OLVANE_C_API olvane_status olvane_family_set_children(olvane_family* family, int64_t id,
                                                      const int64_t* children, size_t count,
                                                      olvane_family_error* error);
OLVANE_C_API olvane_status olvane_family_set_names(olvane_family* family, int64_t id,
                                                   const olvane_name_part* names, size_t count,
                                                   olvane_family_error* error);
/* An empty text removes the field. */
OLVANE_C_API olvane_status olvane_family_set_field(olvane_family* family, int64_t id, const char* key,
                                                   const char* text, olvane_family_error* error);

/* Partners get each other at the end of their lists of spouses, and the children at the end of their lists of children,
   where these are missing. Partners whom no family joins any longer are no longer listed as spouses. */
OLVANE_C_API olvane_status olvane_family_add_family(olvane_family* family, const olvane_family_row* row,
                                                    const olvane_family_child* children, size_t count,
                                                    olvane_family_error* error);
OLVANE_C_API olvane_status olvane_family_set_family(olvane_family* family, const olvane_family_row* row,
                                                    const olvane_family_child* children, size_t count,
                                                    olvane_family_error* error);
OLVANE_C_API olvane_status olvane_family_remove_family(olvane_family* family, int64_t number,
                                                       olvane_family_error* error);

/* ---- Reading a family ------------------------------------------------------------------------------------ */

/* Not ended by a zero byte. */
typedef struct olvane_text {
    const char* bytes;
    size_t length;
} olvane_text;

/* A person as a family has it. preferred is 0 where no spouse is. */
typedef struct olvane_person {
    int64_t id;
    int64_t father; /* 0 for unknown */
    int64_t mother;
    int64_t preferred;
    int32_t sex;
    int32_t dead;
    olvane_text birth;
    olvane_text death;
    olvane_text birth_written;
    olvane_text death_written;
    const uint32_t* spouses; /* null where there are none */
    size_t spouse_count;
    const uint32_t* children;
    size_t child_count;
} olvane_person;

OLVANE_C_API size_t olvane_family_person_count(const olvane_family* family);
OLVANE_C_API size_t olvane_family_family_count(const olvane_family* family);
/* Bytes that the table takes, those included that it shares with copies. */
OLVANE_C_API size_t olvane_family_memory_bytes(const olvane_family* family);
/* All ids in the order in which they were added. ids has room for that many. */
OLVANE_C_API olvane_status olvane_family_person_ids(const olvane_family* family, uint32_t* ids, size_t room);
OLVANE_C_API olvane_status olvane_family_family_numbers(const olvane_family* family, uint32_t* numbers,
                                                        size_t room);

/* OLVANE_INVALID_PERSON for somebody who is not there. */
OLVANE_C_API olvane_status olvane_family_person(const olvane_family* family, int64_t id,
                                                olvane_person* person);
/* The part of a name at a place from 0; OLVANE_INVALID_ARGUMENT behind the last one. */
OLVANE_C_API olvane_status olvane_family_name_at(const olvane_family* family, int64_t id, size_t place,
                                                 int32_t* kind, olvane_text* text);
OLVANE_C_API olvane_status olvane_family_field_at(const olvane_family* family, int64_t id, size_t place,
                                                  olvane_text* key, olvane_text* text);
/* OLVANE_INVALID_ARGUMENT for a number that is not there. Texts of the row are not ended by a zero byte; they are
   handed out beside it. */
OLVANE_C_API olvane_status olvane_family_family(const olvane_family* family, int64_t number,
                                                int64_t* partner0, int64_t* partner1, int32_t* state,
                                                olvane_text* marriage, olvane_text* marriage_written,
                                                olvane_text* marriage_place);
/* count is set to the number of children; no more are written than there is room for. */
OLVANE_C_API olvane_status olvane_family_family_children(const olvane_family* family, int64_t number,
                                                         olvane_family_child* children, size_t room,
                                                         size_t* count);

/* ---- Layouts of a family --------------------------------------------------------------------------------- */

typedef enum olvane_view_kind { OLVANE_VIEW_FAMILY = 0, OLVANE_VIEW_PEDIGREE = 1 } olvane_view_kind;

/* A layout of a person in the family; view is an olvane_view_kind. It is the one that olvane_layout_family and
   olvane_layout_pedigree make of a host with the same answers. OLVANE_INVALID_PERSON, and a layout without boxes, for a
   focus who is not in the family. */
OLVANE_C_API olvane_status olvane_view(const olvane_family* family, int32_t view, int64_t focus,
                                       const olvane_options* options, olvane_layout** layout);

#ifdef __cplusplus
}
#endif
