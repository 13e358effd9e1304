/* SPDX-FileCopyrightText: The Olvane developers */
/* SPDX-License-Identifier: MIT */

/* A database that breaks down in the middle of a layout, and what its program learns of that. */

#include <olvane.h>

#include <stdio.h>

enum { DATABASE_CLOSED = 14 };

static int no_parent(void* context, int64_t person, int64_t* parent) {
    (void)context, (void)person, (void)parent;
    return 0;
}

static int no_list(void* context, int64_t person, olvane_person_list* list) {
    (void)context, (void)person, (void)list;
    return DATABASE_CLOSED;
}

static int not_preferred(void* context, int64_t person, int64_t spouse, int* preferred) {
    (void)context, (void)person, (void)spouse, (void)preferred;
    return 0;
}

static int alive(void* context, int64_t person, int* dead) {
    (void)context, (void)person, (void)dead;
    return 0;
}

static int no_date(void* context, int64_t person, int is_birth, olvane_date* date) {
    (void)context, (void)person, (void)is_birth, (void)date;
    return 0;
}

static int male(void* context, int64_t person, int32_t* sex) {
    (void)context, (void)person, (void)sex;
    return 0;
}

int main(void) {
    const olvane_host host = {sizeof host, NULL,          no_parent, no_parent, no_list,
                              no_list,     not_preferred, alive,     no_date,   male};
    olvane_layout* layout = NULL;
    int code = 0;
    const olvane_status status = olvane_layout_family(&host, 17, NULL, &layout);
    if (status == OLVANE_HOST_FAILED) {
        olvane_layout_host_code(layout, &code);
        printf("%s The callback returned %d.\n", olvane_status_text(status), code);
    }
    olvane_layout_free(layout);
    return status == OLVANE_HOST_FAILED && code == DATABASE_CLOSED ? 0 : 1;
}
