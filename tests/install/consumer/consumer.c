/* Makes a phone in the folder that $ZEL_ROOT names and tells it which customer it has, from C. */
#include <stdio.h>
#include <stdlib.h>
#include <string.h>
#include <zel-host.h>
#include <zel-svc.h>

static int fail(const char *what) {
    fprintf(stderr, "consumer-c: %s\n", what);
    return 1;
}

int main(void) {
    const char *root = getenv("ZEL_ROOT");
    char arguments[512];
    char *answer = NULL;
    char customer[10] = "";
    if (root == NULL) return fail("no ZEL_ROOT");
    snprintf(arguments, sizeof arguments, "{\"root\": \"%s\"}", root);
    if (zel_host_call(NULL, "create", arguments, &answer) != 0) return fail(answer);
    zel_host_free(answer);
    if (zel_svc_config_chk_active_customer_exist() != 0) return fail("a new phone has no customer");
    zel_svc_config_set_active_customer_name("XFV");
    if (zel_svc_config_get_active_customer_name(customer, (int)sizeof customer) != 1) return fail("no customer");
    if (strcmp(customer, "XFV") != 0) return fail(customer);
    puts("consumer-c: XFV");
    return 0;
}
