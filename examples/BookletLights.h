/// The lighthouses of the example `booklet`: their coasts, their names and what is told of them.
#pragma once

#include <algorithm>
#include <array>
#include <numeric>
#include <unicode/unistr.h>
#include <vector>

inline constexpr int lightsOfCoast = 16;
inline constexpr int lightCount = 192;

struct Coast {
    const char16_t* name;
    const char16_t* place; ///< the second half of the names of its lights
};

inline constexpr std::array<Coast, lightCount / lightsOfCoast> coasts = {{
    {u"The North Reach", u"Point"},
    {u"The Slate Coast", u"Rock"},
    {u"The Long Strand", u"Spit"},
    {u"Amber Bay", u"Head"},
    {u"The Narrows", u"Bar"},
    {u"The Outer Skerries", u"Skerry"},
    {u"The Herring Grounds", u"Bank"},
    {u"Widow's Sound", u"Ness"},
    {u"The Green Islands", u"Isle"},
    {u"The Salt Marshes", u"Creek"},
    {u"The Chalk Wall", u"Cliff"},
    {u"The South Roads", u"Haven"},
}};

inline constexpr std::array<const char16_t*, lightsOfCoast> birds = {
    u"Auk",   u"Brent",   u"Curlew",  u"Dotterel", u"Eider",  u"Fulmar", u"Gannet",    u"Heron",
    u"Ivory", u"Kestrel", u"Lapwing", u"Merlin",   u"Osprey", u"Petrel", u"Sandpiper", u"Tern"};

// The lights are numbered from 0 along the coasts.

inline const Coast& getCoast(int light) {
    return coasts.at(static_cast<std::size_t>(light / lightsOfCoast));
}

inline icu::UnicodeString getName(int light) {
    return icu::UnicodeString(birds.at(static_cast<std::size_t>(light % lightsOfCoast))) + u" " +
           getCoast(light).place;
}

inline int getMetres(int light) { return 18 + light * 29 % 41; }

inline int getSeconds(int light) { return 5 + light * 7 % 11; }

/// Returns: a light elsewhere that flashes in the same time.
inline int findTwin(int light) { return light < lightCount / 2 ? light + 88 : light - 88; }

inline std::vector<int> sortByName() {
    std::vector<int> lights(lightCount);
    std::iota(lights.begin(), lights.end(), 0);
    std::sort(lights.begin(), lights.end(),
              [](int one, int other) { return getName(one) < getName(other); });
    return lights;
}
