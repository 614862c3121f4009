/* The same 1,000,000 cells as xlsx_cells_bench (100,000 rows by 10 columns, even columns numbers,
 * odd columns strings from a pool of 5,000) written by the C xlsx writer in its default mode, with
 * seconds and peak memory printed the same way. */
#include <stdio.h>
#include <stdlib.h>
#include <sys/resource.h>
#include <time.h>

#include <xlsxwriter.h>

#define CELL_ROWS 100000
#define CELL_COLS 10
#define POOL_SIZE 5000

static double wall_seconds(void) {
    struct timespec now;
    clock_gettime(CLOCK_MONOTONIC, &now);
    return now.tv_sec + now.tv_nsec / 1e9;
}

/* Processor time of this process: unlike the wall clock, not stretched by other work on the machine. */
static double cpu_seconds(void) {
    struct rusage usage;
    getrusage(RUSAGE_SELF, &usage);
    return usage.ru_utime.tv_sec + usage.ru_stime.tv_sec + (usage.ru_utime.tv_usec + usage.ru_stime.tv_usec) / 1e6;
}

static double peak_mb(void) {
    struct rusage usage;
    getrusage(RUSAGE_SELF, &usage);
    return usage.ru_maxrss / 1024.0;
}

int main(int argc, char** argv) {
    static char pool[POOL_SIZE][32];
    lxw_workbook* book;
    lxw_worksheet* sheet;
    lxw_error error;
    double start;
    int row, col;

    if (argc != 2) {
        fprintf(stderr, "usage: %s FILE\n", argv[0]);
        return 2;
    }
    start = wall_seconds();
    for (row = 0; row < POOL_SIZE; ++row) snprintf(pool[row], sizeof pool[row], "string value %d", row);
    book = workbook_new(argv[1]);
    if (!book) {
        fprintf(stderr, "cannot create %s\n", argv[1]);
        return 1;
    }
    sheet = workbook_add_worksheet(book, "Data");
    for (row = 0; row < CELL_ROWS; ++row) {
        for (col = 0; col < CELL_COLS; ++col) {
            if (col % 2 == 0) worksheet_write_number(sheet, row, col, row * 0.5 + col, NULL);
            else worksheet_write_string(sheet, row, col, pool[(row * (CELL_COLS / 2) + col / 2) % POOL_SIZE], NULL);
        }
    }
    error = workbook_close(book);
    if (error != LXW_NO_ERROR) fprintf(stderr, "save failed: %s\n", lxw_strerror(error));
    printf("peer writer write: %.3f s (cpu %.3f s), peak %.1f MB\n", wall_seconds() - start, cpu_seconds(), peak_mb());
    return error == LXW_NO_ERROR ? 0 : 1;
}
