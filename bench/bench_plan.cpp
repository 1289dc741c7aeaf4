// Plan computation for a year: a parish-sized roster and a large one with many excluded ranges.

#include "data/Datum.h"
#include "data/InitMini.h"
#include "data/Werte.h"
#include "data/Meldungen.h"
#include "data/Uhr.h"
#include "plan/PlanGenerator.h"
#include "plan/Zufall.h"

#include <benchmark/benchmark.h>

#include <algorithm>
#include <random>

namespace {

class JaMeldungen : public Meldungen
{
public:
    Antwort zeige(const QString &, Knoepfe knoepfe, Symbol, const QString &) override
    {
        return knoepfe == Knoepfe::OK || knoepfe == Knoepfe::OKAbbrechen ? Antwort::OK : Antwort::Ja;
    }
};

// n servers in families of up to three, each with `termine` excluded dates (single days and
// ranges of up to a week) inside the year, four services of `proDienst` servers every day.
InitMini Gemeinde(int n, int termine, int proDienst, int jahr, bool nurSpannen)
{
    std::mt19937 rng(uint32_t(n * 31 + termine));
    auto zahl = [&rng](int von, int bis) { return std::uniform_int_distribution<int>(von, bis)(rng); };
    const QDate anfang(jahr, 1, 1);
    const int tage = anfang.daysInYear();

    InitMini d;
    d.Minis.resize(std::size_t(n) + 1);
    for (int i = 0; i < n; ++i) {
        Mini &m = d.Minis[std::size_t(i)];
        m.Name = QStringLiteral("Familie %1").arg(i / 3);
        m.Vorname = QStringLiteral("Kind %1").arg(i);
        m.Strasse = QStringLiteral("Straße %1").arg(i / 3);
        m.Ausgenommen[std::size_t(zahl(1, 7))] = zahl(0, 3) == 0;
        for (int k = 0; k < termine; ++k) {
            const QDate von = anfang.addDays(zahl(0, tage - 1));
            const bool spanne = nurSpannen || zahl(0, 1) == 0;
            m.Termine[std::size_t(k)] =
                spanne ? DatumText(von) + u'-' + DatumText(von.addDays(zahl(1, 6))) : DatumText(von);
        }
        m.AnzahlTermine = int16_t(termine);
    }
    d.AnzahlMinis = int16_t(n);
    d.Sperre.assign(std::size_t(n) + 1, 0);
    d.Einsaetze.assign(std::size_t(n) + 1, 0);
    const QString anzahl = QString::number(proDienst);
    for (int tag = 1; tag <= 7; ++tag) {
        for (int k = 0; k < 4; ++k) {
            d.Regulaer[std::size_t(tag)].Zeit[std::size_t(k)] = QStringLiteral("%1.00").arg(8 + 3 * k);
            d.Regulaer[std::size_t(tag)].MiniAnz[std::size_t(k)] = anzahl;
        }
    }
    return d;
}

void Berechne(benchmark::State &state, InitMini d, const QString &start, const QString &ende)
{
    StandardZufall zufall(7);
    JaMeldungen meldungen;
    SystemUhr uhr;
    PlanGenerator generator(d, zufall);
    for (auto _ : state) {
        // Counters carry over between computations; start every run from the same state.
        std::fill(d.Einsaetze.begin(), d.Einsaetze.end(), int16_t(0));
        std::fill(d.Sperre.begin(), d.Sperre.end(), int16_t(0));
        if (generator.BtnErstellen_Click(start, ende, meldungen, uhr) != PlanGenerator::Ergebnis::Fertig)
            state.SkipWithError("computation failed");
        benchmark::DoNotOptimize(d.Plan.data());
    }
    state.counters["Plaetze"] = double(d.AnzahlPlanEintraege) * ZahlWert(d.Regulaer[1].MiniAnz[0]);
}

void BM_Pfarrei(benchmark::State &state)
{
    Berechne(state, Gemeinde(60, 5, 4, 2027, false), QStringLiteral("01.01.2027"), QStringLiteral("31.12.2027"));
}

// 366 days of 2028, 30 excluded ranges per server.
void BM_Gross(benchmark::State &state)
{
    const int n = int(state.range(0));
    Berechne(state, Gemeinde(n, 30, 10, 2028, true), QStringLiteral("01.01.2028"), QStringLiteral("31.12.2028"));
    state.SetComplexityN(n);
}

} // namespace

BENCHMARK(BM_Pfarrei)->Unit(benchmark::kMillisecond);
BENCHMARK(BM_Gross)->Arg(500)->Arg(1000)->Arg(2000)->Unit(benchmark::kMillisecond)->Complexity(benchmark::oN);
