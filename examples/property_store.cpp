// The property store as an application uses it: typed values under names,
// arrays through element keys, enumeration, and a failed read reported.
#include <cstdio>
#include <string>

#include "vantorbase/vantorbase.h"

int main() {
    Property settings;
    settings.SetValue("Volume", 75);
    settings.SetString("Device", "Speakers");
    settings.SetStringW("Title", L"Living room");
    settings.SetPointer("Owner", &settings);

    // A playlist as an array: one element key per entry.
    const char* const tracks[] = {"Intro", "Theme", "Finale"};
    for (int i = 0; i < 3; ++i) settings.SetString("Track", i, tracks[i]);
    settings.SetValue("TrackCount", 3);

    std::printf("Volume is %d on %s\n", settings.GetValue("Volume"),
                settings.GetString("Device").c_str());
    std::string title;
    wstring2string(title, settings.GetStringW("Title"));
    std::printf("Title: %s\n", title.c_str());
    for (int i = 0; i < settings.GetValue("TrackCount"); ++i)
        std::printf("Track %d: %s (key %s)\n", i, settings.GetString("Track", i).c_str(),
                    Property::GetArrayKey("Track", i).c_str());

    // A copy shares the store: a change through it is seen here.
    Property view = settings;
    view.SetValue("Volume", 40);
    std::printf("Volume after the copy changed it: %d\n", settings.GetValue("Volume"));

    std::printf("Entries, in key order:\n");
    std::string key, type;
    for (int i = 0; i < settings.getCount(); ++i) {
        settings.getKey(i, key);
        if (!settings.getType(i, type)) type = "(empty)";
        std::printf("  %-12s %s\n", key.c_str(), type.c_str());
    }

    // Erased values keep their keys; reading one fails.
    settings.Erase("Track", 0, 1);
    try {
        settings.GetString("Track", 0);
    } catch (const PropertyException& e) {
        std::printf("Caught: %s\n", e.getMessage().c_str());
    }
    try {
        settings.GetValue("Device");
    } catch (const PropertyException& e) {
        std::printf("Caught: %s\n", e.getMessage().c_str());
    }
    return 0;
}
