#pragma once
// Data connections: APN profiles, one row of `pdp_profile` in the network database for each MCC+MNC that they
// serve, and profile handles, which name for one network the profile of each service. Handles come first and
// are written nowhere by themselves: they give each profile its service, and the first profile of a service
// becomes the phone's default for it.
//
//     <Connections>
//       <ProfileHandle><NetworkName>One</NetworkName><ProfBrowser>One Web</ProfBrowser></ProfileHandle>
//       <Profile><NetworkName>One</NetworkName><ProfileName>One Web</ProfileName> ... </Profile>
//     </Connections>
//
// An install replaces the operator's earlier profiles of an MCC+MNC; those that the user made stay.

#include "spec/zel-svc-occurrence.h"

void zel_svc_element_act_connection_start(Occurrence &occurrence);

void zel_svc_element_act_connection_handle_count(Occurrence &occurrence);
void zel_svc_element_act_connection_handle_start(Occurrence &occurrence);
void zel_svc_element_act_connection_handle_value(Occurrence &occurrence);
void zel_svc_element_act_connection_handle_end(Occurrence &occurrence);

void zel_svc_element_act_connection_profile_count(Occurrence &occurrence);
void zel_svc_element_act_connection_profile_start(Occurrence &occurrence);
void zel_svc_element_act_connection_profile_value(Occurrence &occurrence);
void zel_svc_element_act_connection_profile_end(Occurrence &occurrence);

// Free what a parse that ended inside a handle or a profile left open.
void zel_svc_element_act_connection_handle_begin_parse();
void zel_svc_element_act_connection_profile_begin_parse();
