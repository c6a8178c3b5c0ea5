#include "nrxctl/base/service_property.h"

#include "nrxctl/base/failure_report.h"
#include "nrxctl/base/output.h"

namespace nrx {

platform::return_code set_service_property(const platform::service& service, const char* name,
                                           const platform::property* value) {
    if (!check(name, "propertyName")) return platform::bad_argument;
    if (!check(value, "property")) return platform::bad_argument;
    const platform::return_code kr = platform::set_property(service, name, *value);
    check_success(kr, "kr == 0 ");
    return kr;
}

platform::return_code show_service_property(const platform::service& service, const char* name) {
    if (!check(name, "propertyName")) return platform::success;
    const auto property = platform::read_property(service, name);
    if (!check(property, "property")) return platform::success;
    write_error(platform::describe(*property) + "\n");
    return platform::success;
}

}  // namespace nrx
