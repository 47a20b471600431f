#pragma once

#include "filter_record.h"

#include <stdbool.h>
#include <stdio.h>

/* A host's picture behind a filter record that forgives nothing: rows with odd padding, fresh buffers for
 * every advanceState of which the former ones cannot be touched any more, input that cannot be written to,
 * guards around all of it. What a filter does wrong is told in lines that begin with "WRONG: ". */

/* Tells what a filter did wrong. */
void wrong(const char* format, ...) __attribute__((format(printf, 1, 2)));

/* A new picture of 1 to 4 planes with 8 bits, or 16 bits of 0 to 32768; `seed` chooses its content. */
void make_picture(int width, int height, int planes, int depth, int mode, uint32_t seed);

/* The samples, interleaved, from or to a file of nothing else. */
bool load_samples(const char* file);
bool save_samples(const char* file);

/* The record of the picture. It ends where memory that cannot be touched begins. */
struct filter_record* record(void);

/* What selector about gets instead, of its own size. */
void* about_record(void);

/* The n-th advanceState from now on, and none after it, answers `code` and has no buffers; n of 0: none. */
void fail_at(int n, int16_t code);

/* The host's own answer of a filter's request. */
int16_t advance_state(void);

/* How many buffers a filter has handed back, and how often it asked for new ones, since the last begin_run().
 */
int stored_buffers(void);
int advances(void);

/* A run begins with the picture as it is, and ends with the filter's result or, discarded, without. */
void begin_run(void);
void end_run(bool keep);

/* Before and after a selector: looks whether the record has changed only where that selector may change it,
 * and whether the filter goes on after a request that failed. */
void begin_selector(void);
void end_selector(int selector);
