/* What a provider does with the library, in a page: one thread reads the inventory, another follows
 * the events and asks the first to look again. Build it with
 *
 *     cc provider.c -o provider -pthread $(pkg-config --cflags --libs RAIDInstrumentation)
 *
 * It ends with the input or after the seconds that its argument names. Take what you need. */
#define _POSIX_C_SOURCE 200809L
#include <RAIDInstrumentation.h>
#include <poll.h>
#include <pthread.h>
#include <signal.h>
#include <stdatomic.h>
#include <stdio.h>
#include <stdlib.h>
#include <string.h>
#include <time.h>
#include <unistd.h>

static atomic_int stopping;         /* set once, by main */
static atomic_int followerEnded;    /* set once, by the follower */
static atomic_int inventoryIsStale; /* set by the follower, taken by main */

/* No text is longer than the answer that it came in. A provider that does not trust the service for
 * that gives every buffer the size of the largest answer it accepts. */
enum { textSize = 65536 };

static void showInventory(FILE* out) {
    static char text[textSize];
    const int drives = getRAIDDiskDriveCount(); /* the count refreshes, if that is due */
    for (int position = 0; position < drives; ++position) {
        strcpy(text, "unknown"); /* a status without a word leaves the buffer alone */
        getRAIDDiskDriveOverallStatusString(text, position);
        fprintf(out, "adapter %d, channel %d: %s", getRAIDDiskDriveAdapterID(position),
                getRAIDDiskDriveChannelID(position), text);
        getRAIDDiskDriveSerialNumber(text, position);
        fprintf(out, ", serial number %s\n", text);
    }
    fflush(out);
}

static void pauseBriefly(void) {
    const struct timespec pause = {0, 200000000};
    nanosleep(&pause, NULL);
}

/* Every event once: a wait that fails or is cancelled publishes the batch before it again, so the
 * numbers tell what is new, and the next wait always starts behind the last number seen. */
static void* followEvents(void* output) {
    static char text[textSize];
    FILE* const out = output;
    int last = -1;
    while (!stopping) {
        int fresh = 0;
        if (enableRAIDEvent()) {
            const int newest = nextSequenceNumber;
            if (last < 0) {
                last = newest; /* we want what comes after it */
            } else if (newest < last) {
                last = 0; /* the service was restarted and counts anew */
            }
        }
        if (last >= 0) {
            setRAIDEventSequenceNumber(last + 1);
            getEvent();
            for (int position = 0; position < getRAIDEventCount(); ++position) {
                if (getRAIDEventSequenceNumber(position) > last) {
                    last = getRAIDEventSequenceNumber(position);
                    getRAIDEventMessageString(text, position);
                    fprintf(out, "event %d: %s\n", last, text);
                    ++fresh;
                }
            }
            fflush(out);
        }
        if (fresh > 0) {
            inventoryIsStale = 1;
        } else if (!stopping) {
            pauseBriefly(); /* the service is away, or sent something malformed */
        }
    }
    followerEnded = 1;
    return NULL;
}

static void doNothing(int signal) { (void)signal; }

/* A cancel can be lost to an exchange that just begins, so it is repeated; the signal ends the
 * slice of 5 seconds in which the wait looks for cancels. */
static void endFollower(pthread_t follower) {
    stopping = 1;
    while (!followerEnded) {
        cancelGetEvent();
        pthread_kill(follower, SIGUSR1);
        pauseBriefly();
    }
    pthread_join(follower, NULL);
}

/* The library prints a line for each exchange on standard output. This program's own output is
 * meant to be read, so it goes to a copy and the library's to nowhere. */
static FILE* ownOutput(void) {
    FILE* const out = fdopen(dup(STDOUT_FILENO), "w");
    if (out == NULL || freopen("/dev/null", "w", stdout) == NULL) {
        exit(EXIT_FAILURE);
    }
    return out;
}

int main(int argc, char** argv) {
    const time_t end = time(NULL) + (argc > 1 ? strtol(argv[1], NULL, 10) : 3600);
    struct sigaction wake = {0};
    FILE* const out = ownOutput();
    pthread_t follower;
    wake.sa_handler = doNothing;
    sigaction(SIGUSR1, &wake, NULL);

    RAIDinit();
    showInventory(out);
    if (pthread_create(&follower, NULL, followEvents, out) != 0) {
        return EXIT_FAILURE;
    }
    while (time(NULL) < end) {
        struct pollfd input = {STDIN_FILENO, POLLIN, 0};
        if (poll(&input, 1, 100) > 0 && getchar() == EOF) {
            break;
        }
        if (atomic_exchange(&inventoryIsStale, 0)) {
            setRefreshFlag();
            showInventory(out);
        }
    }
    endFollower(follower);
    return EXIT_SUCCESS;
}
