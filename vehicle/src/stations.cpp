// SPDX-License-Identifier: MIT
#include "stations.h"

namespace HmiVehicle {

// All stations are invented.

const Band& amBand()
{
    static const Band band{"AMTunerSource",
                           "kHz",
                           531,
                           1602,
                           9,
                           0,
                           0,
                           {{"558", "Prairie Talk", "Call in: what grows in your garden?", 61, true},
                            {"639", "Radio Lindenau", "Das Gespräch am Mittag", 74, true},
                            {"756", "Harbour Weather", "Sea area west: wind 4 to 5", 48, false},
                            {"873", "Newsline 873", "Headlines every quarter of an hour", 88, true},
                            {"999", "Golden Dial", "Songs your parents danced to", 67, false},
                            {"1116", "Open Mic", "Live from the old tram depot", 55, false},
                            {"1287", "Radio Estrella", "Música sin fronteras", 42, false},
                            {"1458", "Night Owl", "Quiet talk until dawn", 39, false}}};
    return band;
}

const Band& fmBand()
{
    static const Band band{"FMTunerSource",
                           "MHz",
                           87.5,
                           108.0,
                           0.1,
                           1,
                           1,
                           {{"88.7", "Radio Meridian", "Good morning on the Meridian", 82, true, 2},
                            {"91.3", "Klassik Atrium", "Streichquartett in a-Moll", 76, false},
                            {"93.8", "Nova Jazz", "Blue Staircase Trio - Late Tram Home", 71, false, 1},
                            {"96.1", "City Beat", "The Paper Lanterns - Neon Rain", 90, true, 2},
                            {"98.5", "Harbour FM", "Traffic and music for the coast", 94, true, 3},
                            {"100.4", "Alpenklang", "Musik, wo die Berge beginnen", 63, false},
                            {"102.9", "Campus 102", "Lecture hall sessions", 58, false, 1},
                            {"104.6", "Newsline 24", "News at the full and half hour", 85, true, 1},
                            {"105.9", "Sunset 105", "Slow songs for the way home", 69, false},
                            {"107.2", "Radio Karavane", "Sounds from six continents", 52, false}}};
    return band;
}

const Band& xmBand()
{
    static const Band band{"XMTunerSource",
                           "",
                           0,
                           0,
                           0,
                           0,
                           2,
                           {{"8", "Orbit Hits", "Mira Vale - Second Sun", 95, false},
                            {"14", "Deep Blue", "Harold Finch Quintet - Slow Water", 95, false},
                            {"21", "Backroads", "The Dusty Maps - Mile Marker", 93, false},
                            {"34", "Prime Rock", "Iron Orchard - Turn It Over", 94, false},
                            {"52", "Pulse", "Kite Engine - Night Drive", 92, false},
                            {"71", "Symphony Hall", "Overture in D", 96, false},
                            {"98", "Laugh Track", "Live at the Cellar", 94, false},
                            {"121", "World Desk", "The hour in review", 95, true}}};
    return band;
}

const Band& dabBand()
{
    static const Band band{"DABTunerSource",
                           "",
                           0,
                           0,
                           0,
                           0,
                           3,
                           {{"5C Meridian", "Meridian Plus", "More of the Meridian", 88, true},
                            {"5C Atrium", "Atrium Oper", "Heute: Die Nacht im Turm", 84, false},
                            {"7D Kinder", "Radio Knopf", "Geschichten für kleine Ohren", 79, false},
                            {"9B Beat", "City Beat Live", "Tonight from the boiler house", 72, true},
                            {"11C Coast", "Coastline", "Tide tables and tall tales", 81, true},
                            {"11C News", "Newsline Digital", "What happened while you drove", 90, true},
                            {"12A Folk", "Fiddle & Bow", "Reels from the north", 66, false}}};
    return band;
}

} // namespace HmiVehicle
