#pragma once
// The functions behind the command table's rows, one file per topic.

#include "invocation.h"

namespace zel_command {

// runs.cpp
int install(Invocation &invocation);
int upgrade(Invocation &invocation);
int boot(Invocation &invocation);
int imei(Invocation &invocation);
int factory_reset(Invocation &invocation);
int reboot(Invocation &invocation);

// queries.cpp
int customers(Invocation &invocation);
int version(Invocation &invocation);
int approval(Invocation &invocation);

// locks.cpp
int locks(Invocation &invocation);

// verify.cpp
int verify(Invocation &invocation);

// export.cpp
int export_phone(Invocation &invocation);

// log.cpp
int log(Invocation &invocation);

// summary.cpp
int summary(Invocation &invocation);

// vconf.cpp
int vconf_get(Invocation &invocation);
int vconf_set(Invocation &invocation);
int vconf_unset(Invocation &invocation);
int vconf_list(Invocation &invocation);

// sim-cards.cpp
int sim_insert(Invocation &invocation);
int sim_remove(Invocation &invocation);

// sim-slots.cpp
int sim_info(Invocation &invocation);
int sim_active(Invocation &invocation);

// sim-runs.cpp
int sim_run(Invocation &invocation);
int sim_install(Invocation &invocation);
int sim_clear(Invocation &invocation);

// sim-operators.cpp, sim-match.cpp, sim-matrix-page.cpp
int sim_operators(Invocation &invocation);
int sim_match(Invocation &invocation);
int sim_matrix(Invocation &invocation);

// phone-verbs.cpp
int phone_verb(Invocation &invocation);

// manual.cpp
int manual(Invocation &invocation);

// completion.cpp
int completion_bash(Invocation &invocation);

} // namespace zel_command
