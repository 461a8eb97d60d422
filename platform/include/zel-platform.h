#pragma once
// What a phone offers without a client library: files, owners, commands, restart and the clock.
//
// Every path is the phone's own ("/opt/system/zel/..."). On a bench phone it is resolved inside the
// phone's root folder, symbolic links included, and nothing outside that folder can be reached; on a
// device it is the path itself. No other code may turn a path into a file.
//
//     int fd = zel_platform_open("/opt/system/zel-default/output/zel-config.log",
//                                O_WRONLY | O_CREAT | O_APPEND, 0644);
//
//     char name[ZEL_PLATFORM_NAME_MAX];
//     int folder = zel_platform_open_parent("/csa/zel", name);   // then mkdirat(folder, name, 0755)
//
// Functions that return int give -1 and set errno on failure unless they say otherwise.

#include <sys/time.h>
#include <sys/types.h>

#ifdef __cplusplus
extern "C" {
#endif

enum { ZEL_PLATFORM_NAME_MAX = 256 }; // bytes of a file name with its terminator

// Opens (and with O_CREAT creates) the regular file or, with O_DIRECTORY, the folder at an absolute phone
// path. Never blocks and never opens anything but a regular file or folder: a FIFO, socket or device gives
// EINVAL. The descriptor is close-on-exec and belongs to the caller. The mode of a created file is `mode`
// less the process's umask.
int zel_platform_open(const char *path, int flags, mode_t mode);

// Opens the folder that holds the last name of an absolute phone path, for the *at calls that create,
// remove or inspect it, and copies that name to `name` (ZEL_PLATFORM_NAME_MAX bytes). The path must end in
// a plain name: "/", "." and ".." give EINVAL; a name of 256 bytes or more gives ENAMETOOLONG.
// The descriptor is an O_PATH one and belongs to the caller.
// A name that the caller then opens through the descriptor must be opened with O_NOFOLLOW.
int zel_platform_open_parent(const char *path, char *name);

// Owner of an open file or folder. A bench phone records it with the file (its user may not be allowed to
// change owners) and answers what was recorded, or the real owner where nothing was.
int zel_platform_set_owner(int fd, uid_t uid, gid_t gid);
int zel_platform_get_owner(int fd, uid_t *uid, gid_t *gid);

// Runs a shell command of the phone and returns its raw wait status, as system(3) does; -1 when it could
// not be started. A bench phone runs nothing: it answers from its registered tools, 32512 without one.
int zel_platform_command(const char *command);

// Flushes file systems.
void zel_platform_sync(void);

// Restarts the machine with a restart command of reboot(2), 0x01234567 for a plain restart. A bench phone
// records the request and returns 0.
int zel_platform_reboot(int command);

// Wall clock, microseconds since the epoch split as in gettimeofday(2).
int zel_platform_now(struct timeval *now);

#ifdef __cplusplus
}
#endif
