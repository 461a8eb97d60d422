#pragma once
// The telephony client: the phone's modems ("CP", communication processors) and the SIM in each.
//
//     char **names = tel_get_cp_name_list();               // a phone with several modems
//     struct tel_handle *modem = tel_init(names[0]);       // null instead of a name: the only modem
//     struct tel_sim_imsi imsi = {};
//     if (tel_get_sim_imsi(modem, &imsi) == 0) ...
//     tel_deinit(modem);

#ifdef __cplusplus
extern "C" {
#endif

struct tel_handle;

// An IMSI in its parts (3GPP TS 23.003): three digits of MCC, two or three of MNC, up to ten of MSIN.
struct tel_sim_imsi {
    char mcc[4];
    char mnc[4];
    char msin[11];
};

// The names of the phone's modems, that of the first SIM slot first, ended by a null pointer; null when they
// cannot be read. The caller frees each name and then the list, with free(3).
char **tel_get_cp_name_list(void);

// Connects to a modem by its name, or to the phone's only one by null. Null on failure.
struct tel_handle *tel_init(const char *cp_name);

// Reads the IMSI of the modem's SIM. Returns 0 on success, an error number otherwise.
int tel_get_sim_imsi(struct tel_handle *handle, struct tel_sim_imsi *imsi);

// Ends the connection and frees the handle. Returns 0 on success, an error number otherwise.
int tel_deinit(struct tel_handle *handle);

#ifdef __cplusplus
}
#endif
