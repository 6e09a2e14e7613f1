#include <hmiloggingcategory.h>

HmiLoggingCategory::HmiLoggingCategory(const char *category, int channel)
    : QLoggingCategory(category)
{
    Q_UNUSED(channel)
}

HmiLoggingCategory &hmitrace()
{
    static HmiLoggingCategory category("hmi.trace", 1);
    return category;
}

HmiLoggingCategory &hmiperformance()
{
    static HmiLoggingCategory category("hmi.performance", 1);
    return category;
}
