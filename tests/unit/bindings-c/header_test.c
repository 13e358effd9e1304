/* SPDX-FileCopyrightText: The Olvane developers */
/* SPDX-License-Identifier: MIT */

/* The header is C99, and a host in plain C gets its family laid out: a couple (17, 42) and their daughter 5.
 */

#include <olvane.h>
#include <olvane_family.h>
#include <olvane_picture.h>

#include <stdio.h>
#include <string.h>

static int knows_no_parent(void* context, int64_t person, int64_t* parent) {
    (void)context;
    (void)person;
    (void)parent;
    return 0;
}

static int father_of(void* context, int64_t person, int64_t* parent) {
    (void)context;
    if (person == 5) *parent = 17;
    return 0;
}

static int spouses_of(void* context, int64_t person, olvane_person_list* spouses) {
    const int64_t spouse = person == 17 ? 42 : 17;
    (void)context;
    if (person == 5) return 0;
    return olvane_person_list_append(spouses, &spouse, 1) == OLVANE_OK ? 0 : 1;
}

static int children_of(void* context, int64_t person, olvane_person_list* children) {
    const int64_t child = 5;
    (void)context;
    if (person == 5) return 0;
    return olvane_person_list_append(children, &child, 1) == OLVANE_OK ? 0 : 1;
}

static int is_preferred_spouse(void* context, int64_t person, int64_t spouse, int* preferred) {
    (void)context;
    *preferred = person + spouse == 17 + 42;
    return 0;
}

static int is_dead(void* context, int64_t person, int* dead) {
    (void)context;
    *dead = person != 5;
    return 0;
}

static int date_of(void* context, int64_t person, int is_birth, olvane_date* date) {
    (void)context;
    if (person != 5 || !is_birth) return 0;
    return olvane_date_set(date, "1850") == OLVANE_OK ? 0 : 1;
}

static int sex_of(void* context, int64_t person, int32_t* sex) {
    ++*(int*)context;
    *sex = person == 17 ? 0 : 1;
    return 0;
}

int main(void) {
    int questions = 0;
    olvane_host host = {sizeof host, &questions,          father_of, knows_no_parent, spouses_of,
                        children_of, is_preferred_spouse, is_dead,   date_of,         sex_of};
    const olvane_record* records = NULL;
    size_t count = 0;
    const char* text = NULL;
    olvane_layout* layout = NULL;
    const olvane_status status = olvane_layout_family(&host, 17, NULL, &layout);
    if (status != OLVANE_OK) {
        fprintf(stderr, "%s\n", olvane_status_text(status));
        return 1;
    }
    if (olvane_layout_text(layout, &text, NULL) != OLVANE_OK) return 2;
    if (olvane_layout_records(layout, &records, &count) != OLVANE_OK) return 3;
    if (strncmp(text, "17:27:0:", 8) != 0 || count != 5) return 4;
    if (records[0].id != 17 || records[0].x != 27 || records[0].y != 0) return 5;
    if (questions == 0) return 6;
    printf("%s: %s\n", olvane_version(), text);
    olvane_layout_free(layout);
    return 0;
}
