#include "VconfUtil.h"

#include <vconf.h>

#include "CommonLog.h"

namespace NSWeather
{

int VconfUtil::GetRegionFormatTime1224()
{
    int value = 1;
    int ret = vconf_get_int(VCONFKEY_REGIONFORMAT_TIME1224, &value);
    if (ret != VCONF_OK)
    {
        COMMON_LOG("vconf_get_int  failed(%d)", ret);
        return 1;
    }
    return value;
}

}  // namespace NSWeather
