#pragma once
// The bench phone from outside: make one in a folder, look into it, change it, make it fail.
//
//     char *error = NULL;
//     zel_host_phone *phone = zel_host_open("/tmp/phone", &error);
//     char *answer = NULL;
//     if (zel_host_call(phone, "vconf-get", "{\"key\": \"db/zel/salescode\"}", &answer) == 0)
//         puts(answer);                       // {"key":"db/zel/salescode","type":"string","value":"XFV"}
//     zel_host_free(answer);
//     zel_host_close(phone);
//
// Any number of phones can be open at a time, whether or not this process also runs the library on one.
// Every verb of `zel phone VERB` is a verb here with the same arguments and the same answer. Names and
// values are raw: nothing is masked. No call is failed by an injected fault.
//
// Answers are valid JSON whatever bytes the phone holds: in a text that is no UTF-8 each byte that does not
// belong shows as U+FFFD, and a second member, NAME_hex beside NAME, then holds the exact bytes as pairs of
// hexadecimal digits. A value of any bytes is set with "value-hex".
//
// The verb "verbs" answers all verbs with their arguments, types and help.

#ifdef __cplusplus
extern "C" {
#endif

typedef struct zel_host_phone zel_host_phone;

// Opens the phone whose root folder is `root`. Null when it is no phone; *error (may be null) then holds a
// text that the caller releases with zel_host_free().
zel_host_phone *zel_host_open(const char *root, char **error);
void zel_host_close(zel_host_phone *phone);

// Runs one verb. `arguments` is a JSON object, or null for none. Returns 0 and the answer as JSON, or a
// number above 0 (1 failed, 2 unknown verb or wrong arguments) and {"error": "..."}. The answer belongs to
// the caller: zel_host_free(). The verb "create" alone takes a null phone and the argument "root".
int zel_host_call(zel_host_phone *phone, const char *verb, const char *arguments, char **answer);

void zel_host_free(char *text);

#ifdef __cplusplus
}
#endif
