/* SPDX-FileCopyrightText: The Olvane developers */
/* SPDX-License-Identifier: MIT */

#pragma once

/*
 * GEDCOM files, and drawings as SVG. One call draws a person of a file:
 *
 *     olvane_result *svg = NULL;
 *     olvane_status status = olvane_draw_file("family.ged", "Charles Darwin", NULL, &svg);
 *     puts(olvane_result_text(svg, NULL));
 *     olvane_result_free(svg);
 *
 * A file that is opened once answers any number of questions:
 *
 *     olvane_file *file = NULL;
 *     if (olvane_file_open("family.ged", 0, &file, NULL) == OLVANE_OK) olvane_draw(file, 17, NULL, &svg);
 *     olvane_file_free(file);
 *
 * Persons: are numbered from 1 in the order of the file. Where a person is named by a text, it is the number, the
 *     file's own identifier ("I17", "@I17@"), or a name that means one person.
 * Results: every call that sets an olvane_result sets it to what was asked for, or after a failure to a sentence in
 *     English that says what is wrong; to null where there is no memory. The caller frees it.
 * Ownership: files and results belong to the caller. Everything that is passed in is copied or read.
 * Threads: any number may ask one file.
 */

#include <olvane.h>
#include <olvane_family.h>

#ifdef __cplusplus
extern "C" {
#endif

typedef struct olvane_result olvane_result;

/* Ended by a zero byte that length does not count; UTF-8. length may be null. The empty text for a null result. Lives as
   long as the result. */
OLVANE_C_API const char* olvane_result_text(const olvane_result* result, size_t* length);
/* A null result is allowed. */
OLVANE_C_API void olvane_result_free(olvane_result* result);

/* ---- Files ------------------------------------------------------------------------------------------------- */

typedef struct olvane_file olvane_file;

/* Places, occupations and all other facts are read as well, which take time and memory. */
#define OLVANE_READ_FACTS 1u

/* A file of GEDCOM 5.5 to 7.0 in any encoding that is known, or an archive of one where the library was built with
   libzip. OLVANE_UNREADABLE where there is nothing to read; what is wrong in a file is repaired and remarked. failure may
   be null. */
OLVANE_C_API olvane_status olvane_file_open(const char* path, uint32_t flags, olvane_file** file,
                                            olvane_result** failure);
/* The same for bytes; name stands for the file in sentences. */
OLVANE_C_API olvane_status olvane_file_read(const void* bytes, size_t length, const char* name,
                                            uint32_t flags, olvane_file** file, olvane_result** failure);
/* A null file is allowed. */
OLVANE_C_API void olvane_file_free(olvane_file* file);

OLVANE_C_API size_t olvane_file_person_count(const olvane_file* file);

/* The number of the person whom a text means; OLVANE_INVALID_PERSON for nobody and for several. failure may be null. */
OLVANE_C_API olvane_status olvane_file_find(const olvane_file* file, const char* who, int64_t* person,
                                            olvane_result** failure);

/* The file as a table, with names and dates. */
OLVANE_C_API olvane_status olvane_file_family(const olvane_file* file, olvane_family** family);

/* A layout of a person, as olvane_view makes it of the table; view is an olvane_view_kind. */
OLVANE_C_API olvane_status olvane_file_layout(const olvane_file* file, int32_t view, int64_t focus,
                                              const olvane_options* options, olvane_layout** layout);

/* How two persons are related, as one line of JSON: words, degree, coefficient, and the ways by blood, by adoption and
   by marriage. */
OLVANE_C_API olvane_status olvane_file_kinship(const olvane_file* file, int64_t a, int64_t b,
                                               olvane_result** json);

/* The same of a table. */
OLVANE_C_API olvane_status olvane_family_kinship(const olvane_family* family, int64_t a, int64_t b,
                                                 olvane_result** json);

/* What may be odd in the data, as a JSON array: {"kind": ..., "person": ..., "family": ..., "text": ...} for each. */
OLVANE_C_API olvane_status olvane_file_remarks(const olvane_file* file, olvane_result** json);

/* ---- Drawings ---------------------------------------------------------------------------------------------- */

/* Null texts and zeros are the defaults. */
typedef struct olvane_draw_options {
    size_t struct_size; /* sizeof(olvane_draw_options) */
    /* "family", "pedigree", "near", "ancestors", "descendants", "hourglass", "relatives", "fan", "kinship" or "everybody";
       family by default */
    const char* view;
    int64_t to;              /* kinship: the other person */
    int32_t up;              /* generations above the focus; all by default */
    int32_t down;            /* generations below the focus; all by default */
    int32_t generations;     /* pedigree: columns, the focus's own included, up to 12; 5 by default */
    const char* direction;   /* where later generations stand: "down" (default), "up", "left" or "right" */
    const char* boxes;       /* "tall" or "wide"; by default what suits the view */
    const char* theme;       /* "light" (default), "dark" or "print" */
    const char* title;       /* stands above the picture; none by default */
    int32_t unknown_parents; /* family, pedigree: 1 for boxes of parents who are not known */
    int32_t dates;           /* 1 for whole dates, instead of years */
    int32_t places;      /* 1 for places of birth and death; of a file that was read with OLVANE_READ_FACTS */
    int32_t occupation;  /* 1 for the first occupation; of a file that was read with OLVANE_READ_FACTS */
    int32_t marriage;    /* 1 for the year at each line of a marriage */
    int32_t hide_living; /* of a file: 1 to hide everyone who may be living, as "olvane draw --hide-living" */
    int32_t year;        /* the year that hide_living counts from; the present one by default */
} olvane_draw_options;

/* Opens a file, draws a person of it, and closes it: the picture that "olvane draw" makes. options may be null. */
OLVANE_C_API olvane_status olvane_draw_file(const char* path, const char* who,
                                            const olvane_draw_options* options, olvane_result** svg);

/* A person of an open file. */
OLVANE_C_API olvane_status olvane_draw(const olvane_file* file, int64_t focus,
                                       const olvane_draw_options* options, olvane_result** svg);

/* A person of a table, labelled by its names and years; dates, places and occupation change nothing. */
OLVANE_C_API olvane_status olvane_draw_family(const olvane_family* family, int64_t focus,
                                              const olvane_draw_options* options, olvane_result** svg);

#ifdef __cplusplus
}
#endif
