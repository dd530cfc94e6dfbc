#include "base/decimal.h"
#include "base/shared_value.h"
#include "diag/log.h"
#include "orvo/property_file.h"

int LOG_LEVEL = 0;
int configRead = 0;

namespace raid::diag {

void readSettings() {
    // Set first: a file that cannot be read is not tried again.
    base::store(configRead, 1);
    Orvo::PropertyFile settings(Orvo::File::Path("../logs/RAIDInstrumentation.ini"));
    try {
        settings.open(3);
        const auto value = settings.getValue(Orvo::make_wstring("LogLevel"));
        base::store(LOG_LEVEL, base::decimalNumber(Orvo::make_string(value)));
        settings.close();
    } catch (...) {
        // Without readable settings the level stays what it is and the host is not bothered.
        return;
    }
}

}  // namespace raid::diag
