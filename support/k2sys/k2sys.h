/*
 * Interface of the appliance's platform library, libk2sys.so.1.
 *
 * The library built here takes its answers from the environment, so that the program runs on any Linux
 * machine; on the appliance the library of the same name takes its place. All functions may be called from
 * any thread.
 */
#pragma once

#include <stdarg.h>
#include <stddef.h>
#include <time.h>

#ifdef __cplusplus
extern "C" {
#endif

#define K2SYS_API __attribute__((visibility("default")))

/* Starts the library; may be called more than once. Returns 0 on success. */
K2SYS_API int k2sys_init(void);
/* Counterpart of k2sys_init; closes the connection to the system log. */
K2SYS_API void k2sys_exit(void);

/* Same as openlog, syslog and vsyslog of the C library, but the tag is copied. */
K2SYS_API void k2sys_openlog(const char* tag, int option, int facility);
K2SYS_API void k2sys_syslog(int priority, const char* format, ...) __attribute__((format(printf, 2, 3)));
K2SYS_API void k2sys_vsyslog(int priority, const char* format, va_list args)
    __attribute__((format(printf, 2, 0)));

/* Writes the caller's stack to standard error. Allocates nothing, so a signal handler may call it. */
K2SYS_API void k2sys_print_backtrace(void);

/*
 * Each of these writes a NUL-terminated path into a buffer of size bytes and returns a state above 0. If the
 * path does not fit it returns a negative value and, unless size is 0, writes an empty string.
 *
 * root: K2SYS_AC_ROOT, else empty. Returns 1 if it is exactly "/", else 2.
 * data: K2SYS_AC_DATA, else $XDG_DATA_HOME/titler, else $HOME/.local/share/titler, even if
 * that is relative. Returns 1.
 * prefix: K2SYS_AC_PREFIX, else the parent of the folder that the program was started from. Returns 1.
 */
K2SYS_API int k2sys_getenv_ac_root(char* buffer, size_t size);
K2SYS_API int k2sys_getenv_ac_data(char* buffer, size_t size);
K2SYS_API int k2sys_getenv_ac_prefix(char* buffer, size_t size);

/* Gets the current local time. Returns 1 on success, a negative value otherwise. */
K2SYS_API int k2sys_get_time(struct tm* now);

/* Return the total size in bytes of the file system that holds path, and the bytes that an ordinary user can
 * still use; -1 on error. If K2SYS_FS_REMAIN is set to a number, k2sys_fs_remain returns that. */
K2SYS_API long long k2sys_fs_size(const char* path);
K2SYS_API long long k2sys_fs_remain(const char* path);

/* Gets the name of the time zone, usually region, "/" and city. Returns 1 on success, 0 if the machine has no
 * named zone or the name does not fit. */
K2SYS_API int k2sys_get_current_timezone(char* buffer, size_t size);

/*
 * Functions that this program needs beyond the library's interface. They are linked into the program (target
 * titler_support), so that it also runs with the appliance's library.
 *
 * log_dir: K2SYS_LOG_DIR, else "/var/log"; same result values as above.
 * port_offset: K2SYS_PORT_OFFSET, else 0. Added to a TCP port at bind and connect; values outside -1000 to
 * 60000 count as 0.
 */
int k2sys_log_dir(char* buffer, size_t size);
int k2sys_port_offset(void);

#ifdef __cplusplus
}
#endif
