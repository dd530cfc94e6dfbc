/* A host in C, without a C++ runtime of its own:
 *
 *   c_host LIBRARY MANNER
 *
 * loads the library ("" finds the one that the program is linked with), fills its lists, and ends
 * as the manner says. */
#define _GNU_SOURCE
#include <dlfcn.h>
#include <pthread.h>
#include <stdio.h>
#include <stdlib.h>
#include <string.h>
#include <unistd.h>

typedef int (*Call)(void);

static const char* path;
static void* library;

static void require(int holds, const char* what, const char* detail) {
    if (!holds) {
        fprintf(stderr, "%s: %s\n", what, detail);
        _exit(1);
    }
}

static int call(const char* name) {
    Call function;
    void* const found = dlsym(library, name);
    require(found != NULL, "error: no such function", name);
    memcpy(&function, &found, sizeof function);
    return function();
}

static void load(void) {
    library = dlopen(path, RTLD_NOW | RTLD_LOCAL);
    require(library != NULL, "cannot load", library == NULL ? dlerror() : "");
}

static void fill(void) {
    static const char* const lists[] = {"getPellionAdapterCount", "getRAIDDiskDriveCount",
                                        "getRAIDEventCount"};
    size_t list;
    call("RAIDinit");
    call("getEvent");
    for (list = 0; list < sizeof lists / sizeof *lists; ++list) {
        require(call(lists[list]) > 0, "error: empty", lists[list]);
    }
}

static void unload(void) { require(dlclose(library) == 0, "error: cannot unload", path); }

static void fillAtExit(void) { fill(); }

static void* unloadHere(void* unused) {
    unload();
    return unused;
}

static void unloadInAThread(void) {
    pthread_t thread;
    require(pthread_create(&thread, NULL, unloadHere, NULL) == 0, "error: no thread", path);
    require(pthread_join(thread, NULL) == 0, "error: no end of the thread", path);
}

static void loadAgain(void) {
    unload();
    load();
    fill();
    unload();
}

static void nothing(void) {}

static void atExit(void (*function)(void)) {
    require(atexit(function) == 0, "error: cannot arrange for the exit", path);
}

static void unloadAtExit(void) { atExit(unload); }
static void callAtExit(void) { atExit(fillAtExit); }
static void exitQuickly(void) { quick_exit(0); }

struct Manner {
    const char* name;
    void (*beforeLoading)(void);
    void (*end)(void);
};

/* What is arranged for the exit before the library is loaded happens after the library's own end of
 * the process. */
static const struct Manner manners[] = {
    {"unload", nothing, unload},
    {"unloadInAThread", nothing, unloadInAThread},
    {"loadAgain", nothing, loadAgain},
    {"unloadAtExit", nothing, unloadAtExit},
    {"unloadAtExitLate", unloadAtExit, nothing},
    {"callAtExit", nothing, callAtExit},
    {"exitQuickly", nothing, exitQuickly},
    {"never", nothing, nothing},
};

int main(int argc, char** argv) {
    size_t index = 0;
    const size_t count = sizeof manners / sizeof *manners;
    require(argc == 3, "usage", "c_host LIBRARY MANNER");
    path = argv[1];
    while (index < count && strcmp(manners[index].name, argv[2]) != 0) {
        ++index;
    }
    require(index < count, "error: no such manner", argv[2]);
    manners[index].beforeLoading();
    load();
    fill();
    manners[index].end();
    return 0;
}
