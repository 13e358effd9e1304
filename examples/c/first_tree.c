/* SPDX-FileCopyrightText: The Olvane developers */
/* SPDX-License-Identifier: MIT */

/* A first tree: five persons of the program's own, laid out around Henry and drawn to tree.svg. */

#include <olvane.h>

#include <stdio.h>

struct person {
    const char* name;
    int32_t sex;    /* 0 for male */
    int64_t father; /* 0 where not known */
    int64_t mother;
};

/* The id of a person is the place in this table. */
static const struct person persons[] = {
    {"", 0, 0, 0},          {"Henry", 0, 4, 5},  {"Anne", 1, 0, 0},
    {"Elizabeth", 1, 1, 2}, {"Edmund", 0, 0, 0}, {"Margaret", 1, 0, 0},
};
enum { person_count = sizeof persons / sizeof persons[0] };

static int father_of(void* context, int64_t id, int64_t* parent) {
    (void)context;
    if (persons[id].father != 0) *parent = persons[id].father;
    return 0;
}

static int mother_of(void* context, int64_t id, int64_t* parent) {
    (void)context;
    if (persons[id].mother != 0) *parent = persons[id].mother;
    return 0;
}

static int children_of(void* context, int64_t id, olvane_person_list* children) {
    int64_t child;
    (void)context;
    for (child = 1; child < person_count; ++child) {
        if (persons[child].father != id && persons[child].mother != id) continue;
        if (olvane_person_list_append(children, &child, 1) != OLVANE_OK) return 1;
    }
    return 0;
}

/* Everyone who has a child with the person; here nobody has more than one child with anybody. */
static int spouses_of(void* context, int64_t id, olvane_person_list* spouses) {
    int64_t child;
    (void)context;
    for (child = 1; child < person_count; ++child) {
        const struct person* p = &persons[child];
        if (p->father == id && olvane_person_list_append(spouses, &p->mother, 1) != OLVANE_OK) return 1;
        if (p->mother == id && olvane_person_list_append(spouses, &p->father, 1) != OLVANE_OK) return 1;
    }
    return 0;
}

static int is_preferred_spouse(void* context, int64_t id, int64_t spouse, int* preferred) {
    (void)context;
    (void)id;
    (void)spouse;
    *preferred = 1;
    return 0;
}

static int is_dead(void* context, int64_t id, int* dead) {
    (void)context;
    (void)id;
    *dead = 1;
    return 0;
}

static int date_of(void* context, int64_t id, int is_birth, olvane_date* date) {
    (void)context;
    (void)id;
    (void)is_birth;
    return olvane_date_set(date, "") == OLVANE_OK ? 0 : 1;
}

static int sex_of(void* context, int64_t id, int32_t* sex) {
    (void)context;
    *sex = persons[id].sex;
    return 0;
}

static void draw(const olvane_record* boxes, size_t count, FILE* svg) {
    enum { width = 55, height = 80 };
    int left = 0, top = 0, right = 0, bottom = 0;
    size_t i, k;
    for (i = 0; i < count; ++i) {
        if (boxes[i].x - 10 < left) left = boxes[i].x - 10;
        if (boxes[i].y - 10 < top) top = boxes[i].y - 10;
        if (boxes[i].x + width + 10 > right) right = boxes[i].x + width + 10;
        if (boxes[i].y + height + 10 > bottom) bottom = boxes[i].y + height + 10;
    }
    fprintf(svg, "<svg xmlns=\"http://www.w3.org/2000/svg\" viewBox=\"%d %d %d %d\">\n", left, top,
            right - left, bottom - top);
    for (i = 0; i < count; ++i) {
        for (k = 0; k < boxes[i].segment_count; ++k) {
            const olvane_segment* line = &boxes[i].segments[k];
            fprintf(svg, "<path d=\"M%d %dL%d %d\" stroke=\"black\"/>\n", line->x1, line->y1, line->x2,
                    line->y2);
        }
    }
    for (i = 0; i < count; ++i) {
        const char* name = boxes[i].kind == OLVANE_PERSON ? persons[boxes[i].id].name : "?";
        fprintf(svg, "<rect x=\"%d\" y=\"%d\" width=\"%d\" height=\"%d\" fill=\"white\" stroke=\"black\"/>\n",
                boxes[i].x, boxes[i].y, width, height);
        fprintf(svg, "<text x=\"%d\" y=\"%d\" font-size=\"10\">%s</text>\n", boxes[i].x + 4, boxes[i].y + 44,
                name);
    }
    fprintf(svg, "</svg>\n");
}

int main(void) {
    const olvane_host host = {sizeof host,         NULL,    father_of, mother_of, spouses_of, children_of,
                              is_preferred_spouse, is_dead, date_of,   sex_of};
    const olvane_record* boxes = NULL;
    size_t count = 0;
    olvane_layout* layout = NULL;
    const olvane_status status = olvane_layout_family(&host, 1, NULL, &layout);
    FILE* svg = status == OLVANE_OK ? fopen("tree.svg", "w") : NULL;
    if (svg) {
        olvane_layout_records(layout, &boxes, &count);
        draw(boxes, count, svg);
        fclose(svg);
    } else {
        fprintf(stderr, "%s\n", olvane_status_text(status));
    }
    olvane_layout_free(layout);
    return svg ? 0 : 1;
}
