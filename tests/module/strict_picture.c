#define _GNU_SOURCE
#include "strict_picture.h"

#include <stdarg.h>
#include <stdlib.h>
#include <string.h>
#include <sys/mman.h>
#include <unistd.h>

enum { guard_byte = 0xA5, tail_guard = 32, full_scale_16 = 32768 };

/* Memory of one request. It ends, after a few guard bytes, where memory that cannot be touched begins. */
struct buffer {
    uint8_t* pages;
    size_t mapped; /* bytes that can be touched */
    uint8_t* data;
    int stride;
    struct request request;
};

static struct {
    int width, height, planes, depth;
    uint8_t* source;      /* as it is */
    uint8_t* destination; /* with what the filter has written */
    struct buffer in, out;
    int requests, stored, advances;
    int fail_in;
    int16_t fail_code;
    bool failed;
} picture;

static struct filter_record* the_record;
static struct filter_record remembered;

void wrong(const char* format, ...) {
    va_list arguments;
    va_start(arguments, format);
    fputs("WRONG: ", stdout);
    vprintf(format, arguments);
    putchar('\n');
    va_end(arguments);
}

/* `size` bytes right before a page that cannot be touched, at the end of `*mapped` bytes from `*pages` on. */
static uint8_t* map_before_guard(size_t size, size_t* mapped, uint8_t** pages) {
    const size_t page = (size_t)sysconf(_SC_PAGESIZE);
    *mapped = (size + page - 1) / page * page;
    *pages = mmap(NULL, *mapped + page, PROT_READ | PROT_WRITE, MAP_PRIVATE | MAP_ANONYMOUS, -1, 0);
    if (*pages == MAP_FAILED || mprotect(*pages + *mapped, page, PROT_NONE) != 0) {
        perror("memory of the host");
        exit(3);
    }
    return *pages + *mapped - size;
}

static bool is_empty(struct rectangle area) {
    return area.right <= area.left || area.bottom <= area.top;
}

static int bytes_per_sample(void) {
    return picture.depth / 8;
}

static size_t picture_size(void) {
    return (size_t)picture.width * (size_t)picture.height * (size_t)(picture.planes * bytes_per_sample());
}

static int planes_of(struct request request) {
    return request.high_plane - request.low_plane + 1;
}

static size_t row_size(struct request request) {
    return (size_t)(request.area.right - request.area.left) * (size_t)planes_of(request) *
           (size_t)bytes_per_sample();
}

static int rows_of(struct request request) {
    return request.area.bottom - request.area.top;
}

/* Where a request's first sample of a row stands in the picture. */
static size_t place(struct request request, int row) {
    const size_t pixel = (size_t)(request.area.top + row) * (size_t)picture.width + (size_t)request.area.left;
    return (pixel * (size_t)picture.planes + (size_t)request.low_plane) * (size_t)bytes_per_sample();
}

/* Copies a row between the picture and a buffer, of each pixel the requested planes. */
static void copy_row(struct request request, uint8_t* at_picture, uint8_t* at_buffer, bool to_picture) {
    const size_t pixel = (size_t)(picture.planes * bytes_per_sample());
    const size_t part = (size_t)(planes_of(request) * bytes_per_sample());
    for (int x = request.area.left; x < request.area.right; ++x, at_picture += pixel, at_buffer += part)
        memcpy(to_picture ? at_picture : at_buffer, to_picture ? at_buffer : at_picture, part);
}

static void take(struct buffer* buffer, struct request request, uint8_t* from) {
    static const int odd[] = {13, 1, 29, 7};
    const int padding = odd[picture.requests++ % 4] * bytes_per_sample();
    buffer->request = request;
    buffer->stride = (int)row_size(request) + padding;
    const size_t size = (size_t)buffer->stride * (size_t)rows_of(request) + tail_guard;
    buffer->data = map_before_guard(size, &buffer->mapped, &buffer->pages);
    memset(buffer->pages, guard_byte, buffer->mapped);
    for (int row = 0; row < rows_of(request); ++row)
        copy_row(request, from + place(request, row), buffer->data + (size_t)row * (size_t)buffer->stride,
                 false);
}

static void expect_guard(const uint8_t* from, const uint8_t* to, const char* where) {
    for (const uint8_t* at = from; at < to; ++at)
        if (*at != guard_byte) {
            wrong("written %s", where);
            return;
        }
}

static void check_guards(const struct buffer* buffer) {
    const uint8_t* row = buffer->data;
    expect_guard(buffer->pages, row, "before the output buffer");
    for (int y = 0; y < rows_of(buffer->request); ++y, row += buffer->stride)
        expect_guard(row + row_size(buffer->request), row + buffer->stride, "into the padding of a row");
    expect_guard(row, buffer->pages + buffer->mapped, "behind the output buffer");
}

static void check_range(const struct buffer* buffer) {
    if (picture.depth != 16)
        return;
    for (int y = 0; y < rows_of(buffer->request); ++y)
        for (size_t x = 0; x < row_size(buffer->request); x += 2) {
            uint16_t sample;
            memcpy(&sample, buffer->data + (size_t)y * (size_t)buffer->stride + x, sizeof sample);
            if (sample > full_scale_16) {
                wrong("a sample of %d", sample);
                return;
            }
        }
}

static void store(void) {
    const struct buffer* out = &picture.out;
    if (!out->pages)
        return;
    check_guards(out);
    check_range(out);
    for (int row = 0; row < rows_of(out->request); ++row)
        copy_row(out->request, picture.destination + place(out->request, row),
                 out->data + (size_t)row * (size_t)out->stride, true);
    ++picture.stored;
}

/* The addresses are never used again: whoever still writes there ends the process. */
static void release(struct buffer* buffer) {
    if (buffer->pages)
        mprotect(buffer->pages, buffer->mapped, PROT_NONE);
    memset(buffer, 0, sizeof *buffer);
}

static void release_all(void) {
    release(&picture.in);
    release(&picture.out);
    if (!the_record)
        return;
    the_record->in_data = the_record->out_data = the_record->mask_data = NULL;
    the_record->in_row_bytes = the_record->out_row_bytes = the_record->mask_row_bytes = 0;
}

static bool is_inside(struct request request, const char* which) {
    if (is_empty(request.area))
        return true;
    const struct rectangle area = request.area;
    const bool inside = area.left >= 0 && area.top >= 0 && area.right <= picture.width &&
                        area.bottom <= picture.height && request.low_plane >= 0 &&
                        request.low_plane <= request.high_plane && request.high_plane < picture.planes;
    if (!inside)
        wrong("%s request of rows %d to %d, columns %d to %d, planes %d to %d", which, area.top, area.bottom,
              area.left, area.right, request.low_plane, request.high_plane);
    return inside;
}

static int16_t answer_requests(void) {
    struct filter_record* asked = record();
    const struct request in = asked->in;
    const struct request out = asked->out;
    if (!is_inside(in, "an input") || !is_inside(out, "an output"))
        return parameter_error;
    if (!is_empty(in.area)) {
        take(&picture.in, in, picture.source);
        mprotect(picture.in.pages, picture.in.mapped, PROT_READ);
        asked->in_data = picture.in.data;
        asked->in_row_bytes = picture.in.stride;
    }
    if (!is_empty(out.area)) {
        take(&picture.out, out, picture.destination);
        asked->out_data = picture.out.data;
        asked->out_row_bytes = picture.out.stride;
    }
    return no_error;
}

int16_t advance_state(void) {
    ++picture.advances;
    if (picture.failed)
        wrong("an advanceState after one that failed");
    if (picture.fail_in > 0 && --picture.fail_in == 0) {
        picture.failed = picture.fail_code != no_error;
        release_all();
        return picture.fail_code;
    }
    store();
    release_all();
    return answer_requests();
}

static uint8_t nobody_aborts(void) {
    return 0;
}

static void no_progress(int32_t done, int32_t total) {
    (void)done;
    (void)total;
}

static void fill_record(int mode) {
    static char error_string[256];
    static void* window[1];
    struct filter_record* filled = record();
    memset(filled, 0, sizeof *filled);
    filled->abort_proc = nobody_aborts;
    filled->progress_proc = no_progress;
    filled->advance_state = advance_state;
    filled->image_width = filled->whole_width = (int16_t)picture.width;
    filled->image_height = filled->whole_height = (int16_t)picture.height;
    filled->filter_rect = (struct rectangle){0, 0, (int16_t)picture.height, (int16_t)picture.width};
    filled->planes = (int16_t)picture.planes;
    filled->depth = picture.depth;
    filled->image_mode = (int16_t)mode;
    filled->horizontal_resolution = filled->vertical_resolution = 72 << 16;
    filled->max_space = filled->buffer_space = 123456789;
    filled->host_signature = 0x3842494D;
    filled->filter_case = 1;
    filled->dummy_plane_value = -1;
    filled->input_padding = filled->output_padding = filled->mask_padding = -3;
    filled->sampling_support = 1;
    filled->input_rate = filled->mask_rate = 0x10000;
    filled->platform_data = window;
    filled->error_string = error_string;
}

/* Light that grows to the right and downwards, with grain, so that there is something to correct. */
static int content(int x, int y, int plane, uint32_t* state) {
    *state = *state * 1664525U + 1013904223U;
    const int light = 40 + 90 * x / picture.width + 50 * y / picture.height + 11 * plane;
    return light + (int)(*state >> 28);
}

void make_picture(int width, int height, int planes, int depth, int mode, uint32_t seed) {
    free(picture.source);
    free(picture.destination);
    picture.width = width;
    picture.height = height;
    picture.planes = planes;
    picture.depth = depth;
    picture.source = malloc(picture_size());
    picture.destination = malloc(picture_size());
    uint8_t* at = picture.source;
    for (int y = 0; y < height; ++y)
        for (int x = 0; x < width; ++x)
            for (int plane = 0; plane < planes; ++plane, at += bytes_per_sample()) {
                const int value = content(x, y, plane, &seed);
                const uint16_t deep = (uint16_t)(value * full_scale_16 / 255);
                if (depth == 16)
                    memcpy(at, &deep, sizeof deep);
                else
                    *at = (uint8_t)value;
            }
    fill_record(mode);
    begin_run();
}

static bool transfer(const char* name, const char* mode) {
    FILE* file = fopen(name, mode);
    if (!file)
        return false;
    const size_t done = *mode == 'r' ? fread(picture.source, 1, picture_size(), file)
                                     : fwrite(picture.source, 1, picture_size(), file);
    return fclose(file) == 0 && done == picture_size();
}

bool load_samples(const char* file) {
    return transfer(file, "rb");
}

bool save_samples(const char* file) {
    return transfer(file, "wb");
}

struct filter_record* record(void) {
    size_t mapped;
    uint8_t* pages;
    if (!the_record)
        the_record = (struct filter_record*)map_before_guard(sizeof *the_record, &mapped, &pages);
    return the_record;
}

void* about_record(void) {
    static void* window[1];
    size_t mapped;
    uint8_t* pages;
    uint8_t* about = map_before_guard(about_record_size, &mapped, &pages);
    const void* platform = window;
    memcpy(about, &platform, sizeof platform);
    mprotect(pages, mapped, PROT_READ);
    return about;
}

void fail_at(int n, int16_t code) {
    picture.fail_in = n;
    picture.fail_code = code;
}

int stored_buffers(void) {
    return picture.stored;
}

int advances(void) {
    return picture.advances;
}

void begin_run(void) {
    memcpy(picture.destination, picture.source, picture_size());
    picture.stored = picture.advances = 0;
    record()->in = record()->out = (struct request){0};
}

void end_run(bool keep) {
    release_all();
    picture.fail_in = 0;
    if (keep)
        memcpy(picture.source, picture.destination, picture_size());
}

void begin_selector(void) {
    picture.failed = false;
    memcpy(&remembered, record(), sizeof remembered);
}

void end_selector(int selector) {
    struct filter_record now;
    memcpy(&now, record(), sizeof now);
    if (selector == 2)
        now.buffer_space = remembered.buffer_space;
    if (selector == 3) {
        now.in = remembered.in;
        now.out = remembered.out;
    }
    /* What this host itself writes there. */
    now.in_data = remembered.in_data;
    now.out_data = remembered.out_data;
    now.mask_data = remembered.mask_data;
    now.in_row_bytes = remembered.in_row_bytes;
    now.out_row_bytes = remembered.out_row_bytes;
    now.mask_row_bytes = remembered.mask_row_bytes;
    const uint8_t* before = (const uint8_t*)&remembered;
    const uint8_t* after = (const uint8_t*)&now;
    for (size_t i = 0; i < sizeof now; ++i)
        if (before[i] != after[i]) {
            wrong("selector %d changed the record at offset %zu", selector, i);
            return;
        }
}
