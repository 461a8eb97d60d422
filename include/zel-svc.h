#ifndef ZEL_SVC_H
#define ZEL_SVC_H
/*
 * zel-svc: turns a blank phone into the phone of one mobile operator (the "customer").
 *
 * The phone's image carries the operator's package under "/opt/system/zel". At the phone's first start the
 * set-up code calls
 *
 *     zel_svc_config_set_pre_config_for_config_mode("XFV");
 *
 * which reads the package and writes the operator's settings into the phone. After a firmware update over
 * the air it calls zel_svc_config_upgrade_pre_config_for_fota_mode(), and on the first normal start behind
 * that zel_svc_config_upgrade_pre_config_for_normal_booting().
 *
 * Conventions
 *  1. There is no initialisation and no handle: all state belongs to the process. Nothing is locked: one
 *     function runs at a time. Every function runs to completion on the caller's thread; none starts one.
 *  2. Texts are UTF-8 and terminated by a zero byte. A size counts the terminator: what does not fit is cut
 *     at a whole character. A buffer of size 0 is not touched.
 *  3. Functions return 1 for success and 0 for failure unless they say otherwise. Installs and boot entry
 *     points report nothing: what went wrong is in the run log,
 *     "/opt/system/zel-default/output/zel-config.log", and no failure stops a run.
 *  4. A null argument gives 0, or does nothing where there is no result, unless a function allows it.
 *  5. Every buffer and record belongs to the caller; the library keeps none and hands out none.
 *  6. A sales code ("XFV") is a text of at most 9 bytes. MCC and MNC are those of ITU-T E.212, the MSIN is
 *     the rest of the IMSI (E.212), GID and SPN are the SIM's elementary files of those names (3GPP TS 31.102).
 */

#include <stdint.h>

#ifdef __cplusplus
extern "C" {
#endif

#if defined(__GNUC__)
#define ZEL_SVC_API __attribute__((visibility("default")))
#else
#define ZEL_SVC_API
#endif

enum { ZEL_SVC_MAX_CUSTOMERS = 120, ZEL_SVC_MAX_OPERATORS = 270, ZEL_SVC_MAX_LOCKS = 70 };

/* What an install is for. */
typedef enum {
    ZEL_SVC_INSTALL_CONFIG_MODE = 0,   /* full configuration, first start */
    ZEL_SVC_INSTALL_FOTA_MODE = 1,     /* upgrade after a firmware update, before normal start */
    ZEL_SVC_INSTALL_NORMAL_BOOTING = 2 /* upgrade on the first normal start after a firmware update */
} ZelSvcInstallKind;

/* One customer of the package: its sales code and the path of its file below "/opt/system/zel/mps/ZEL". */
typedef struct {
    char name[10];
    char path[256];
} ZelSvcCustomer;

/* Approval versions of the phone's software. An empty text: unknown. */
typedef struct {
    char ap[20];  /* application processor */
    char cp[20];  /* communication processor */
    char zel[20]; /* customer package */
} ZelSvcApprovalVersion;

/*
 * SIM personalisation data (3GPP TS 22.022) of the active customer. The counts are those that the customer's
 * file states and may lie below 0 or above 70: bound every loop by ZEL_SVC_MAX_LOCKS.
 */
typedef struct {
    int32_t network_lock_count;
    char network_locks[ZEL_SVC_MAX_LOCKS][20];
    int32_t sp_lock_count;
    char sp_locks[ZEL_SVC_MAX_LOCKS][20];
    int32_t subset_lock_count;
    char subset_locks[ZEL_SVC_MAX_LOCKS][20];
    int32_t cp_lock_count;
    char cp_locks[ZEL_SVC_MAX_LOCKS][20];
    char auto_network_lock[20];
    int32_t auto_sim_lock; /* 0 or 1 */
    int32_t auto_sp_lock;  /* 0 or 1 */
    int32_t unlock_count;
} ZelSvcSecurityLock;

/* One line of a verification. */
typedef struct {
    char text[306];
    int32_t passed; /* 1 or 0 */
} ZelSvcVerificationResult;

/* Identity of an inserted SIM. */
typedef struct {
    char mccmnc[10];
    char msin[20];
    char gid[10]; /* never read from the card: empty */
    char spn[15]; /* never read from the card: empty */
} ZelSvcSimInfo;

/* One operator of a customer: the customer whose file is installed and the network it is installed for. */
typedef struct {
    char customer_name[10];
    char network_name[40];
    char mccmnc[10];
    char subset_code[10]; /* leading digits of the MSIN, from the element SPCode; empty: any */
    char gid[10];         /* group identifier, from the element SubsetCode; empty: any */
    char sp_name[20];     /* service provider name; empty: any */
} ZelSvcSimOperator;

/*
 * Appends a text to the run log, "/opt/system/zel-default/output/zel-config.log", as it is: the caller brings
 * the newline. Returns 1, or 0 when the log cannot be opened or written.
 */
ZEL_SVC_API int zel_svc_config_print_log_file(const char *text);

#ifdef __cplusplus
}
#endif

#ifdef __cplusplus
static_assert(sizeof(ZelSvcCustomer) == 266, "layout of the interface");
static_assert(sizeof(ZelSvcApprovalVersion) == 60, "layout of the interface");
static_assert(sizeof(ZelSvcSecurityLock) == 5648, "layout of the interface");
static_assert(sizeof(ZelSvcVerificationResult) == 312, "layout of the interface");
static_assert(sizeof(ZelSvcSimInfo) == 55, "layout of the interface");
static_assert(sizeof(ZelSvcSimOperator) == 100, "layout of the interface");
#elif defined(__STDC_VERSION__) && __STDC_VERSION__ >= 201112L
_Static_assert(sizeof(ZelSvcCustomer) == 266, "layout of the interface");
_Static_assert(sizeof(ZelSvcApprovalVersion) == 60, "layout of the interface");
_Static_assert(sizeof(ZelSvcSecurityLock) == 5648, "layout of the interface");
_Static_assert(sizeof(ZelSvcVerificationResult) == 312, "layout of the interface");
_Static_assert(sizeof(ZelSvcSimInfo) == 55, "layout of the interface");
_Static_assert(sizeof(ZelSvcSimOperator) == 100, "layout of the interface");
#endif

#endif
