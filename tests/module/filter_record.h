#pragma once

#include <stddef.h>
#include <stdint.h>

/* What this host knows of the filter interface on 64-bit systems; it shares nothing with the module. */

#pragma pack(push, 4)

struct rectangle {
    int16_t top, left, bottom, right; /* right and bottom are exclusive */
};

struct request {
    struct rectangle area;
    int16_t low_plane, high_plane;
};

struct filter_record {
    int32_t serial_number;
    uint8_t (*abort_proc)(void);
    void (*progress_proc)(int32_t done, int32_t total);
    void* parameters;
    int16_t image_height, image_width;
    int16_t planes;
    struct rectangle filter_rect;
    uint8_t old_colours[12];
    uint8_t gap_1[2];
    int32_t max_space;
    int32_t buffer_space;
    struct request in;
    struct request out;
    void* in_data;
    int32_t in_row_bytes;
    void* out_data;
    int32_t out_row_bytes;
    uint8_t is_floating, have_mask, auto_mask;
    uint8_t gap_2;
    struct rectangle mask_rect;
    void* mask_data;
    int32_t mask_row_bytes;
    uint8_t colours[8];
    uint32_t host_signature;
    void* host_proc;
    int16_t image_mode;
    uint8_t gap_3[2];
    int32_t horizontal_resolution, vertical_resolution;
    int16_t float_coordinates[2];
    int16_t whole_height, whole_width;
    uint8_t monitor[40];
    void** platform_data;
    uint8_t suites[40];
    uint8_t supports[2];
    int16_t want_layout;
    int16_t filter_case;
    int16_t dummy_plane_value;
    void* premiere_hook;
    int16_t (*advance_state)(void);
    uint8_t absolute[4];
    void* property_proc;
    uint8_t cannot_undo, supports_padding;
    int16_t input_padding, output_padding, mask_padding;
    int8_t sampling_support, reserved_byte;
    uint8_t gap_4[2];
    int32_t input_rate, mask_rate;
    uint8_t planes_and_tiles[120];
    char* error_string;
    uint8_t ports_and_plug_ins[32];
    int32_t depth;
    uint8_t newer[540];
};

#pragma pack(pop)

#define AT(field, offset)                                                                                    \
    _Static_assert(offsetof(struct filter_record, field) == (offset), "the place of " #field)

AT(progress_proc, 12);
AT(image_height, 28);
AT(planes, 32);
AT(filter_rect, 34);
AT(max_space, 56);
AT(buffer_space, 60);
AT(in, 64);
AT(in.low_plane, 72);
AT(out, 76);
AT(out.high_plane, 86);
AT(in_data, 88);
AT(in_row_bytes, 96);
AT(out_data, 100);
AT(out_row_bytes, 108);
AT(have_mask, 113);
AT(mask_rect, 116);
AT(mask_data, 124);
AT(host_signature, 144);
AT(image_mode, 156);
AT(horizontal_resolution, 160);
AT(whole_height, 172);
AT(monitor, 176);
AT(platform_data, 216);
AT(want_layout, 266);
AT(filter_case, 268);
AT(dummy_plane_value, 270);
AT(advance_state, 280);
AT(cannot_undo, 300);
AT(input_padding, 302);
AT(sampling_support, 308);
AT(input_rate, 312);
AT(error_string, 440);
AT(depth, 480);
_Static_assert(sizeof(struct filter_record) == 1024, "room for the fields of newer hosts");

#undef AT

enum {
    about_record_size = 272,
    no_error = 0,
    parameter_error = -50,
    memory_error = -108,
};

typedef void (*plugin_main)(int16_t selector, void* record, intptr_t* data, int16_t* result);
