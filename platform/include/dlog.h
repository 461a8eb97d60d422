#pragma once
// The platform's system log.

#ifdef __cplusplus
extern "C" {
#endif

enum { DLOG_ID_MAIN = 0 };
enum { DLOG_PRIORITY_WARN = 5 };

// Appends one formatted message to a log buffer under a tag. The message is kept as it is, a trailing
// newline included. Returns the number of bytes written, negative on failure.
int __dlog_print(int log_id, int priority, const char *tag, const char *format, ...)
#ifdef __GNUC__
    __attribute__((format(printf, 4, 5)))
#endif
    ;

#ifdef __cplusplus
}
#endif
