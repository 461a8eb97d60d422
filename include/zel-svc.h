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

enum { ZEL_SVC_MAX_CUSTOMERS = 120, ZEL_SVC_MAX_OPERATORS = 270, ZEL_SVC_MAX_LOCKS = 70, ZEL_SVC_MAX_RESULTS = 1000 };

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

/* Identity of an inserted SIM: its IMSI in two parts (3GPP TS 23.003, clause 2.2), and what tells an operator
 * from another one of the same network (EF GID1 and EF SPN, 3GPP TS 31.102). The MSIN identifies a subscriber:
 * the logs of this library show its first three digits, and as many as the subset code that it matched has; a
 * caller's should show no more. */
typedef struct {
    char mccmnc[10];
    char msin[20];
    char gid[10]; /* group identifier; never read from the card: empty */
    char spn[15]; /* service provider name; never read from the card: empty */
} ZelSvcSimInfo;

/* What a run of SIM auto setting came to. */
typedef enum {
    ZEL_SVC_SIM_INSTALLED = 0,         /* an operator was installed for at least one slot */
    ZEL_SVC_SIM_SELECTION_NEEDED = 1,  /* the user has to choose for at least one slot, whatever the other did */
    ZEL_SVC_SIM_NOTHING_INSTALLED = 2, /* no SIM, the same one as last time, an unreadable one, or no operator */
    ZEL_SVC_SIM_NO_CUSTOMER = 3,       /* the phone has no active customer */
    ZEL_SVC_SIM_DISABLED = 4           /* the phone's switch for it is off or unreadable */
} ZelSvcSimResult;

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
 * Installs.
 *
 * Each writes what it does to the run log. A sales code that is empty, "." or "..", or holds "/" names no
 * folder: each of its files counts as missing, and the run goes on with what does not depend on them.
 */

/*
 * Applies one customer's specification to the phone. `customer` names the folder as it is (no internal name
 * is looked up) and is cut to 9 bytes. `kind` is a ZelSvcInstallKind; any other number writes the start and
 * end lines of configuration mode and its time, and installs nothing.
 *
 * On a phone with more than one SIM slot the groups that depend on the SIM are installed once more, into the
 * second SIM's network database ("/opt/dbspace/.dnet2.db") and its "-2" section files. That pass does not
 * resolve the networks again: fast dormancy and the maximum number of PDP contexts get the network ids of
 * the first SIM's database.
 */
ZEL_SVC_API void zel_svc_config_install_customer(const char *customer, int kind);

/* Applies the package's header: its names and versions go to the settings store ("db/private/zel/bin_name",
 * "db/private/zel/bin_version", "db/zel/bincode", "db/zel/bin_full_version"). */
ZEL_SVC_API void zel_svc_config_install_header(void);

/* First start: stores the active customer, installs the header and the customer's full configuration, and
 * sets "db/private/telephony/zel_config" to 1. The display is kept on meanwhile. */
ZEL_SVC_API void zel_svc_config_set_pre_config_for_config_mode(const char *customer);

/* After a firmware update, before normal start: stores the active customer, installs the header, and upgrades
 * presets, user files and file system. The customer's file is not read. */
ZEL_SVC_API void zel_svc_config_upgrade_pre_config_for_fota_mode(const char *customer);

/* First normal start after a firmware update: reads the active customer's file again, for the networks, the
 * groups whose Auto flag is 0 and IMS. Without an active customer it does nothing. The display is kept on
 * meanwhile. */
ZEL_SVC_API void zel_svc_config_upgrade_pre_config_for_normal_booting(void);

/* Stores the active customer and nothing else; 1. For factory tools that write the IMEI. */
ZEL_SVC_API int zel_svc_config_set_pre_config_for_imei(const char *customer);

/* Before a factory reset: starts a new run log, sets "db/menu_widget/language" to the language that the
 * customer's specification named, and deletes "/opt/system/zel-default/SW_Configuration.xml"; 1. */
ZEL_SVC_API int zel_svc_config_set_pre_config_for_factory_reset(void);

/* Flushes file systems and restarts the phone. */
ZEL_SVC_API void zel_svc_config_reboot(void);

/*
 * The active customer: the sales code that the phone is configured for. "db/zel/salescode" is the working
 * copy; "/csa/zel/zel-active-customer.inf" survives a factory reset.
 */

/*
 * Stores a code in the settings store, in /csa and in the last three bytes of the phone's product code
 * ("/csa/imei/prodcode.dat"), and sets "db/zel/operator", "db/zel/operator_country", "db/zel/operator_region"
 * and "db/zel/operator_sim" to the code's numbers, 0 for an unknown code. Every step is tried, whatever the
 * one before it did; failures are in the run log. A code of fewer than three bytes leaves the product code
 * as it is; of a longer one it takes the first three.
 */
ZEL_SVC_API void zel_svc_config_set_active_customer_name(const char *customer);

/* Copies the active customer's code; `buffer` may be null and `size` 0 or less to ask only whether there is
 * one. 0, and an empty buffer, when there is none: the key cannot be read, is empty, or is "DEF". */
ZEL_SVC_API int zel_svc_config_get_active_customer_name(char *buffer, int size);

/* 1 when there is an active customer, else 0. */
ZEL_SVC_API int zel_svc_config_chk_active_customer_exist(void);

/* The three bytes that /csa keeps of the active customer's code. 0, and an empty buffer, when there are not as
 * many; 0 too with a null buffer or a size of 0 or less. */
ZEL_SVC_API int zel_svc_config_get_active_customer_name_from_csa(char *buffer, int size);

/*
 * Queries of the package, "/opt/system/zel/mps/ZEL/SW_Configuration.xml" and the customers' files. They parse
 * the file anew and set the process's parse mode, so they do not belong into the middle of an install.
 */

/* The folder that a sales code uses: "TFG" and 1 for the codes that share it, else the code itself and 0. */
ZEL_SVC_API int zel_svc_config_get_internal_customer_name(const char *customer, char *buffer, int size);

/*
 * Fills `list`, which must hold ZEL_SVC_MAX_CUSTOMERS entries, and `count`, 0 to ZEL_SVC_MAX_CUSTOMERS. The
 * count is the one that the package states: an entry that the package does not describe has an empty name.
 * 1 also without a package (count 0).
 */
ZEL_SVC_API int zel_svc_config_get_customer_list(ZelSvcCustomer *list, int32_t *count);

/* 1 when the package lists the folder of a sales code. An empty name never exists. */
ZEL_SVC_API int zel_svc_config_chk_customer_name_exist_in_zel_bin(const char *customer);

/* The name of the package's first customer. 0, and an empty buffer, when there is none. */
ZEL_SVC_API int zel_svc_config_get_first_customer_name_in_zel_bin(char *buffer, int size);

/*
 * The package's name directly followed by its version, at most 9 bytes of each. 0 and "Q0000NXBBBB1" when the
 * phone knows either not; a size below 1 gives 0.
 * Writes: what the header states goes to "db/private/zel/bin_name", "db/private/zel/bin_version" and
 * "db/zel/bincode"; what it does not state is answered from those keys.
 */
ZEL_SVC_API int zel_svc_config_get_zel_bin_version(char *buffer, int size);

/*
 * The approval versions of "/opt/system/zel-default/usr/zel/zel-approval-ver.ini", at most 19 bytes each. The
 * customer package's version is answered only where the file states the communication processor's. 1 when
 * any version is filled; else 0 and an empty record.
 */
ZEL_SVC_API int zel_svc_config_get_approval_version(ZelSvcApprovalVersion *result);

/* 1 when that file states any of the three versions, an empty one included. */
ZEL_SVC_API int zel_svc_config_chk_approval_version_exist(void);

/*
 * The SIM locks of the active customer's file; 0 without an active customer, the record is then left as it is.
 * A file without locks, and a missing one, give an empty record and 1.
 * Writes: starts the security group's file, "/opt/system/zel-default/data/zel-default-data-security.ini",
 * afresh and records the locks there.
 */
ZEL_SVC_API int zel_svc_config_get_security_lock_info(ZelSvcSecurityLock *result);

/*
 * Verification and export: is this phone what its package says, and what does it say itself?
 */

/*
 * Compares the phone with the active customer's file and writes the report,
 * "/opt/system/zel-default/output/zel-verification-report.log". `results` must hold ZEL_SVC_MAX_RESULTS entries;
 * `count` is set to how many were filled, in the order of the report, and what comes behind the last one is lost:
 *   "[FS] media/wallpaper size 4096=>4096"              media folders, after the install and now
 *   "[App][Customer1] com.example.shop(tpk,install)"    what the package tool reported
 *   "[Spec][GPS/GPSActivation] Spec='on',Phone='off'"   the customer's file; "??" is a value that cannot be read
 * Without the figures of an install there are no lines of the first kind. What the customer's Auto flags leave to
 * the SIM card is not compared. Only failed lines of the third kind make the report say "NOT OK!" and count there
 * as failures; those of the other two are marked in their lines. Returns 1, or 0 when the report cannot be opened:
 * the list is filled all the same. Without an active customer there are no lines of the third kind.
 * Writes: the report; "/opt/system/zel-default/output/zel-fs-status-verify.ini"; the keys that
 * zel_svc_config_get_zel_bin_version() writes.
 */
ZEL_SVC_API int zel_svc_config_verification(ZelSvcVerificationResult *results, int32_t *count);

/*
 * The same for tools that want one answer: how many lines of any kind failed, and the first of them in `buffer`,
 * which is empty when none did. Without an active customer 1 and "Pre-configuration not found!". `buffer` may be
 * null.
 */
ZEL_SVC_API int zel_svc_config_verification_for_imei(char *buffer, int size);

/*
 * Writes the phone's present settings as a customer's file,
 * "/opt/system/zel-default/output/customer-phone.xml". What that format cannot carry is listed in the
 * documentation; the networks among it, so a package needs them added before it can install the profiles. Returns
 * 0, and leaves an earlier document as it was, when the file cannot be written or memory ran out.
 */
ZEL_SVC_API int zel_svc_config_encoding_xml(void);

/*
 * SIM auto setting: on phones whose SIM card decides the operator, the platform calls
 * zel_svc_sim_auto_setting_execute_by_sim() after each start.
 *
 * A slot is 1 or 2. Slot 2 is the second SIM's; any other number is the first's.
 */

/*
 * Looks at each SIM slot and, where the SIM is another one than last time, finds the operator of the active
 * customer that it belongs to and installs it: a ZelSvcSimResult.
 *
 * One match is installed, set active, and the SIM's identity kept, so that the same SIM is not looked at again;
 * without a match the identity alone is kept. With several nothing is installed and
 * "db/private/zel/sim_selection_show" (slot 2: "db/private/zel/sim2/sim_selection_show") becomes 1: the caller
 * lets the user choose among zel_svc_sim_auto_setting_get_operator_list_by_sim() and then, itself,
 *
 *  1. calls zel_svc_sim_auto_setting_install_operator() and zel_svc_sim_auto_setting_set_active_operator(),
 *  2. stores the SIM's identity in "db/private/zel/sim_mcc_mnc" and "db/private/zel/sim_msin" (slot 2:
 *     "db/private/zel/sim2/..."), or the next run asks again, and
 *  3. sets the selection key to 0.
 *
 * "memory/private/zel/sim_changed" (bool; slot 2: "memory/private/zel/sim2/sim_changed") becomes 1 when a SIM
 * has changed; only zel_svc_sim_auto_setting_clear_active_operator() resets it.
 *
 * What was found and decided stands in "/opt/system/zel-default/output/zel-sim-check.log" and, from the
 * discovery of another SIM on, in "zel-sim-setting.log" beside it (slot 2: "zel-sim2-...").
 */
ZEL_SVC_API int zel_svc_sim_auto_setting_execute_by_sim(void);

/* Whether the SIM decides the operator: 0 no (the key "db/private/zel/sim_auto_enable" is 0 or cannot be read, or
 * there is no active customer), 1 yes, 2 yes and a choice of the user is awaited for a slot. */
ZEL_SVC_API int zel_svc_sim_auto_setting_chk_feature_enable(void);

/* Reads the SIM of a slot. 0, and an empty record, when its IMSI cannot be read. GID and SPN stay empty. */
ZEL_SVC_API int zel_svc_sim_auto_setting_get_sim_info(ZelSvcSimInfo *info, int slot);

/*
 * Fills `list`, which must hold ZEL_SVC_MAX_OPERATORS entries, with the networks that the active customer's
 * file states, or with `all_customers` not 0 with those of every customer of the package, and sets `count`.
 * Entries beyond ZEL_SVC_MAX_OPERATORS are left out. The files are parsed anew, so this does not belong into
 * the middle of an install.
 */
ZEL_SVC_API void zel_svc_sim_auto_setting_get_operator_list(ZelSvcSimOperator *list, int32_t *count, int all_customers);

/*
 * Fills `list`, which must hold ZEL_SVC_MAX_OPERATORS entries, with the active customer's operators that a SIM
 * may belong to, in the file's order, and sets `count`. The MCC and MNC must be the SIM's. Then an entry's
 * subset code (the first digits of the MSIN), or else its GID, or else its SP name (compared without regard to
 * the case of ASCII letters) decides: the first entry whose own is the SIM's is the only one listed. Without
 * such an entry, those that ask for none of the three are listed. Since GID and SPN are not read from the card,
 * entries that ask for them match only a record that the caller filled.
 */
ZEL_SVC_API void zel_svc_sim_auto_setting_get_operator_list_by_sim(const ZelSvcSimInfo *info, ZelSvcSimOperator *list,
                                                                   int32_t *count);

/*
 * Installs an operator for a slot: of the groups whose Auto flag the active customer's file sets (APN profiles,
 * bookmarks, voicemail, e-mail accounts, WB-AMR, fast dormancy, maximum PDP contexts), and of the IMS settings
 * in any case, the entries that `customer_name`'s file holds for `network_name`. Only these two fields decide;
 * the others are told in the setting log. The telephony daemon is told that its APN profiles are new, and its
 * answer awaited for the bus library's time-out (25 seconds) at most.
 *
 * Bookmarks, e-mail accounts and WB-AMR codecs are one for both slots: the later install wins. At the end
 * "memory/zel/sim_auto_setting_updated" becomes 1; nothing in this library resets it. The operator is not
 * recorded as active: see below. Nothing is reported: a failed reset is in the system log, but a customer file
 * that is missing or broken, and what could not be written, show nowhere.
 */
ZEL_SVC_API void zel_svc_sim_auto_setting_install_operator(const ZelSvcSimOperator *operator_entry, int slot);

/* Does nothing, and returns its argument: kept for callers that link it. */
ZEL_SVC_API int zel_svc_reinstall_connection(int value);

/*
 * The active operator: the one that the inserted SIM card decided on, kept for each SIM slot in string keys
 * below "db/private/zel". The customer's name is one for both slots.
 */

/*
 * Stores the operator of a slot; 1 when every key could be written. An empty customer name leaves the stored
 * one as it is. It writes the operator's keys and no others: where the user chose the operator, the caller
 * installs it, sets it active, stores the SIM's identity ("db/private/zel/sim_mcc_mnc",
 * "db/private/zel/sim_msin", "db/private/zel/sim2/...") and clears "db/private/zel/sim_selection_show" itself.
 */
ZEL_SVC_API int zel_svc_sim_auto_setting_set_active_operator(const ZelSvcSimOperator *operator_entry, int slot);

/*
 * Forgets the operators and the SIM identities of both slots, so that every inserted SIM counts as new, and
 * resets the selection and SIM-changed flags ("memory/private/zel/sim_changed" is reset nowhere else). The
 * customer's name stays. 1 when every key could be written.
 */
ZEL_SVC_API int zel_svc_sim_auto_setting_clear_active_operator(void);

/* Reads the operator of a slot; the record may be null. 1 when all six keys are there; what is there is
 * filled in any case. The service provider's name is cut to 14 bytes. */
ZEL_SVC_API int zel_svc_sim_auto_setting_get_active_operator(ZelSvcSimOperator *operator_entry, int slot);

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
