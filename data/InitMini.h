#pragma once

#include <QString>

#include <array>
#include <cstdint>
#include <vector>

// The shared data of one program run: roster, services, plan, settings and the counters of the
// plan generator. Windows and the command-line tool read and write the members directly.
//
// Counts and indices are signed 16-bit values, because the data file and the generator's
// limits are defined in that range. Arrays indexed "1 To 7" keep an unused element 0 so that the
// weekday number (1 = Sonntag .. 7 = Samstag) is the index.

inline constexpr int MaxTermine = 31;   // Termine(0 To 30)
inline constexpr int MaxPlaetze = 41;   // Name(0 To 40), Vorname(0 To 40)

struct Mini {
    QString Name;
    QString Vorname;
    QString Strasse;
    QString Telefon;
    QString Ort;
    std::array<bool, 8> Ausgenommen{};            // 1 = Sonntag .. 7 = Samstag, [0] unused
    std::array<QString, MaxTermine> Termine;       // used: 0 .. AnzahlTermine-1
    int16_t AnzahlTermine = 0;
    bool Oberministrant = false;
    bool NichtEinteilen = false;
};

// Four service slots; Zeit[k-1] and MiniAnz[k-1] are Zeit k and MiniAnz k.
struct RegulaererTag {
    std::array<QString, 4> Zeit;
    std::array<QString, 4> MiniAnz;
};

struct AusnahmeSeite {
    QString Datum;
    std::array<QString, 4> Zeit;
    std::array<QString, 4> MiniAnz;
};

struct PlanEintrag {
    QString Datum;
    QString Wochentag;
    QString Zeit;
    int16_t MiniAnz = 0;
    std::array<QString, MaxPlaetze> Name;
    std::array<QString, MaxPlaetze> Vorname;
};

// The default data file: the root of the current drive where there are drives, the home folder
// elsewhere (a root folder is not writable there).
QString StandardDateiname();

struct InitMini {
    InitMini();

    std::vector<Mini> Minis;                  // size AnzahlMinis + 1 (spare top element) or more
    int16_t AnzahlMinis = 0;
    std::vector<AusnahmeSeite> Ausnahmen;
    int16_t AnzahlAusnahmen = 0;
    int16_t AnzahlPlanEintraege = 0;
    std::array<RegulaererTag, 8> Regulaer;    // 1..7
    std::array<QString, 8> Wochentag;         // 1..7
    std::vector<PlanEintrag> Plan;
    std::array<int16_t, 5> TagesMiniAnz{};    // 1..4
    std::array<QString, 5> TagesZeit;         // 1..4
    std::vector<int16_t> Sperre;              // parallel to Minis
    std::vector<int16_t> Einsaetze;           // parallel to Minis
    bool Geschwister = true;
    bool Geaendert = false;
    int16_t Intervall = 2;
    QString Dateiname;
    QString AlterDateiname;
    bool DateiLaden = false;
    bool DateiSpeichernUnter = false;
};
