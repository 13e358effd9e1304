/* SPDX-FileCopyrightText: The Olvane developers */
/* SPDX-License-Identifier: MIT */

/* draw_file FILE WHO: one person of a GEDCOM file, drawn with ancestors and descendants, as SVG. */

#include <stdio.h>

#include <olvane_file.h>

int main(int argc, char** argv) {
    olvane_draw_options options = {sizeof(olvane_draw_options)};
    olvane_result* svg = NULL;
    olvane_status status;
    if (argc != 3) {
        fprintf(stderr, "usage: draw_file FILE WHO\n");
        return 2;
    }
    options.view = "hourglass";
    status = olvane_draw_file(argv[1], argv[2], &options, &svg);
    if (status == OLVANE_OK) fputs(olvane_result_text(svg, NULL), stdout);
    if (status != OLVANE_OK) fprintf(stderr, "%s\n", olvane_result_text(svg, NULL));
    olvane_result_free(svg);
    return status == OLVANE_OK ? 0 : 1;
}
