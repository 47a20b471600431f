/* A host of filter modules that knows nothing of the one that it loads but the filter interface: no toolkit,
 * no code in common. It reads commands, one a line, from standard input, and prints a line for each:
 *
 *   load FILE, unload            the module
 *   haunt                        takes the addresses of the module that was unloaded
 *   image WIDTH HEIGHT PLANES DEPTH MODE SEED     a new picture
 *   read FILE, write FILE        its samples
 *   rect TOP LEFT BOTTOM RIGHT   the area to filter
 *   fail N CODE                  the n-th advanceState from now on answers the code
 *   call SELECTOR                one selector
 *   elsewhere SELECTOR           the same on a thread of its own
 *   run                          a whole run: parameters, prepare, start, and what follows by its result
 *   again N                      n runs, of which only what goes wrong is printed
 *   env NAME [VALUE]             a variable of the environment, set or taken away
 *   shell COMMAND                a command, waited for
 *   state                        threads, open files and the heap
 *   surroundings                 the locale and the toolkit's variable
 *   clicker FILE                 loads the library that stands in for the user
 *   click STEP                   what the user will do next in the module's windows
 *   host WORD                    a host that uses the module's toolkit itself: see the clicker */
#define _GNU_SOURCE
#include "process_state.h"
#include "strict_picture.h"

#include <dlfcn.h>
#include <locale.h>
#include <pthread.h>
#include <stdlib.h>
#include <string.h>
#include <unistd.h>

enum { line_size = 8192, result_guard = 0x5A5A, untouched_result = 0x7777, time_limit = 90 };

static struct {
    char file[4096];
    void* handle;
    plugin_main entry;
    intptr_t cells[3]; /* the module's own, between two that are not */
} module;

static struct {
    void (*add)(const char* step);
    void (*rest)(void);
    void (*host)(const char* word);
} clicker;

static void* symbol(void* handle, const char* name) {
    void* found = handle ? dlsym(handle, name) : NULL;
    if (!found)
        wrong("%s", dlerror());
    return found;
}

static void load(const char* file) {
    snprintf(module.file, sizeof module.file, "%s", file);
    module.handle = dlopen(file, RTLD_NOW | RTLD_LOCAL);
    *(void**)&module.entry = symbol(module.handle, "PluginMain");
    if (module.entry && remember_addresses(file))
        puts("loaded");
}

static void unload(const char* nothing) {
    (void)nothing;
    dlclose(module.handle);
    module.handle = NULL;
    module.entry = NULL;
    puts(is_loaded(module.file) ? "still loaded" : "unloaded");
}

static void haunt_addresses(const char* nothing) {
    (void)nothing;
    if (haunt() > 0)
        puts("haunted");
    else
        wrong("the module's addresses are taken");
}

static int16_t send(int selector) {
    struct {
        int16_t before, result, after;
    } cell = {result_guard, untouched_result, result_guard};
    intptr_t* cells = module.cells;
    if (!module.entry) {
        wrong("no module for selector %d", selector);
        exit(3);
    }
    begin_selector();
    alarm(time_limit);
    module.entry((int16_t)selector, selector == 0 ? about_record() : (void*)record(), cells + 1,
                 &cell.result);
    alarm(0);
    end_selector(selector);
    if (cell.before != result_guard || cell.after != result_guard)
        wrong("written beside the result");
    if (cells[0] != 0 || cells[1] != 0 || cells[2] != 0)
        wrong("written to the host's cells");
    return cell.result;
}

static void let_user_rest(void) {
    if (clicker.rest)
        clicker.rest();
}

static void call(const char* selector) {
    const int number = atoi(selector);
    const int result = send(number);
    let_user_rest();
    printf("call %d: %d\n", number, result);
    if (number == 2)
        printf("buffer space %d\n", record()->buffer_space);
}

static void* call_on_thread(void* selector) {
    call(selector);
    return NULL;
}

static void elsewhere(const char* selector) {
    pthread_t thread;
    if (pthread_create(&thread, NULL, call_on_thread, (void*)selector) == 0)
        pthread_join(thread, NULL);
}

static bool has_rectangle(void) {
    static const struct rectangle none;
    const struct filter_record* now = record();
    return memcmp(&now->in.area, &none, sizeof none) != 0 ||
           memcmp(&now->out.area, &none, sizeof none) != 0 ||
           memcmp(&now->mask_rect, &none, sizeof none) != 0;
}

/* After a start that succeeded. */
static int16_t finish(void) {
    int16_t result = no_error;
    if (has_rectangle())
        wrong("rectangles are left after start");
    for (int most = 9; result == no_error && has_rectangle() && most > 0; --most) {
        result = advance_state();
        if (result == no_error)
            result = send(4);
    }
    if (result == no_error)
        result = advance_state();
    const int16_t finished = send(5);
    return result == no_error ? finished : result;
}

/* Whether it succeeded. */
static bool run_once(bool tell) {
    char answers[64] = "";
    int16_t result = no_error;
    begin_run();
    for (int selector = 1; selector <= 3 && result == no_error; ++selector) {
        result = send(selector);
        sprintf(answers + strlen(answers), " %d:%d", selector, result);
    }
    if (result == no_error) {
        result = finish();
        sprintf(answers + strlen(answers), " 5:%d", result);
    }
    if (tell || result != no_error)
        printf("run%s, stored %d, advanced %d\n", answers, stored_buffers(), advances());
    end_run(result == no_error);
    let_user_rest();
    return result == no_error;
}

static void run(const char* nothing) {
    (void)nothing;
    run_once(true);
}

static void again(const char* times) {
    for (int i = atoi(times); i > 0; --i)
        if (!run_once(false))
            return;
    puts("again");
}

static void image(const char* arguments) {
    int width, height, planes, depth, mode;
    unsigned seed;
    if (sscanf(arguments, "%d %d %d %d %d %u", &width, &height, &planes, &depth, &mode, &seed) == 6)
        make_picture(width, height, planes, depth, mode, seed);
    else
        wrong("image %s", arguments);
}

static void read_samples(const char* file) {
    if (!load_samples(file))
        wrong("cannot read %s", file);
}

static void write_samples(const char* file) {
    if (!save_samples(file))
        wrong("cannot write %s", file);
}

static void rect(const char* arguments) {
    struct rectangle area;
    if (sscanf(arguments, "%hd %hd %hd %hd", &area.top, &area.left, &area.bottom, &area.right) == 4)
        record()->filter_rect = area;
    else
        wrong("rect %s", arguments);
}

static void fail(const char* arguments) {
    int n, code;
    if (sscanf(arguments, "%d %d", &n, &code) == 2)
        fail_at(n, (int16_t)code);
    else
        wrong("fail %s", arguments);
}

static void environment(const char* arguments) {
    char name[64] = "";
    int length = 0;
    sscanf(arguments, "%63s %n", name, &length);
    if (arguments[length])
        setenv(name, arguments + length, 1);
    else
        unsetenv(name);
}

static void shell(const char* command) {
    if (system(command) != 0)
        wrong("%s", command);
}

static void state(const char* nothing) {
    (void)nothing;
    print_state();
}

static void surroundings(const char* nothing) {
    (void)nothing;
    const char* platform = getenv("QT_QPA_PLATFORM");
    printf("locale %s, platform %s\n", setlocale(LC_ALL, NULL), platform ? platform : "none");
}

static void load_clicker(const char* file) {
    void* handle = dlopen(file, RTLD_NOW | RTLD_LOCAL);
    *(void**)&clicker.add = symbol(handle, "clicker_add");
    *(void**)&clicker.rest = symbol(handle, "clicker_rest");
    *(void**)&clicker.host = symbol(handle, "clicker_host");
}

static void click(const char* step) {
    clicker.add(step);
}

static void host(const char* word) {
    clicker.host(word);
}

static const struct {
    const char* name;
    void (*act)(const char* arguments);
} commands[] = {
    {"load", load},
    {"unload", unload},
    {"haunt", haunt_addresses},
    {"image", image},
    {"read", read_samples},
    {"write", write_samples},
    {"rect", rect},
    {"fail", fail},
    {"call", call},
    {"elsewhere", elsewhere},
    {"run", run},
    {"again", again},
    {"env", environment},
    {"shell", shell},
    {"state", state},
    {"surroundings", surroundings},
    {"clicker", load_clicker},
    {"click", click},
    {"host", host},
};

static void obey(char* line) {
    line[strcspn(line, "\n")] = '\0';
    char* arguments = line + strcspn(line, " ");
    if (*arguments)
        *arguments++ = '\0';
    for (size_t i = 0; i < sizeof commands / sizeof *commands; ++i)
        if (strcmp(commands[i].name, line) == 0) {
            commands[i].act(arguments);
            return;
        }
    wrong("no command %s", line);
}

int main(void) {
    char line[line_size];
    setvbuf(stdout, NULL, _IOLBF, 0);
    make_picture(64, 48, 3, 8, 3, 1);
    while (fgets(line, sizeof line, stdin))
        obey(line);
    puts("end");
    return 0;
}
