#pragma once
// The networks of the network database, one row of `network_info` for each MCC+MNC. Every other table of the
// database refers to a network by its id, which comes from here.
//
//     std::int32_t id = 0;
//     if (__zel_svc_network_info_get_id("Vodafone", "26202", 1, &id) == 1 && id >= 1) use(id);
//
// Each call opens and closes the database of ZEL_SVC_NETWORK_DB_PATH. Nothing is logged.

#include <cstdint>

// With `create` 1: the id of the row of an MCC+MNC, which takes the given name; a new row, of the next id,
// when there is none. Otherwise: the id of the row of that name and MCC+MNC, 0 when there is none.
// Returns 1, or 0 with an id of 0 when the database failed. A null text gives 0 and leaves the id alone.
int __zel_svc_network_info_get_id(const char *network_name, const char *mccmnc, int create, std::int32_t *id);

// Removes every network; 1 when that ran to completion.
int __zel_svc_network_info_delete_all();

// How many rows an MCC+MNC has. Returns 1 when the question could be asked, whatever became of the answer.
int __zel_svc_network_info_count(const char *mccmnc, std::int32_t *count);
