#ifndef NSWEATHER_CONTENT_PROVIDER_H
#define NSWEATHER_CONTENT_PROVIDER_H

#include <string>

#include "Setting.h"

namespace NSWeather
{

// Codes of the outside weather sources, chosen by the setting's CpType.
enum ContentProviderType
{
    CP_ACCUWEATHER = 0,
    CP_CMAWEATHER = 1,
    CP_KWEATHER = 2,
    CP_WEATHERNEWS_KR = 3,
    CP_WEATHERNEWS = 4
};

// Which provider the suite fetches from, and its logo. Reads the setting
// database on every call, so a provider switched by the weather
// application shows at once; only inside a RebuildScope is it read once.
class ContentProvider
{
public:
    // One rebuild asks for the provider and its icon set dozens of times;
    // while an object of this class lives, the first successful read of the
    // settings answers them all.
    // Scopes nest; the answer is forgotten when the outermost one ends.
    class RebuildScope
    {
    public:
        RebuildScope();
        ~RebuildScope();
        RebuildScope(const RebuildScope&) = delete;
        RebuildScope& operator=(const RebuildScope&) = delete;
    };

    virtual ~ContentProvider() = default;

    // A ContentProviderType; CP_ACCUWEATHER for an unknown text or when
    // the settings cannot be read.
    static int GetContentProvider();
    // The settings record the provider comes from: read afresh, or once
    // per RebuildScope. Null when it cannot be read.
    static SettingPtr GetSetting();
    // Image file name without folder, or empty when no logo is shown.
    static std::string GetCPLogoIconPath(int style);
    // The code for one CpType text (exact comparison).
    static int GetContentProviderOfCpType(const std::string& cpType);
};

}  // namespace NSWeather

#endif
