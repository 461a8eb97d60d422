#include "base/zel-svc-active-customer.h"
#include "base/zel-svc-key-text.h"
#include "base/zel-svc-text.h"
#include "zel-svc-configuration-phases.h"

#include <vconf.h>

void zel_svc_config_set_customer_strings() {
    FixedText<ZEL_SVC_SALES_CODE_SIZE> customer;
    zel_svc_config_get_active_customer_name(customer.data(), ZEL_SVC_SALES_CODE_SIZE);
    vconf_set_str("db/zel/text_string_customer", customer.c_str());

    const std::string country = zel_svc_key_text_or_empty("db/zel/country_iso");
    if (!country.empty()) vconf_set_str("db/zel/text_string_country", country.c_str());
}
