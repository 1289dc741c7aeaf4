#include "data/DatenDatei.h"

#include "data/InitMini.h"

#include <QFile>
#include <QTemporaryDir>

#include <benchmark/benchmark.h>

namespace {

// The largest roster a file can hold: 32,767 servers with 30 excluded dates or ranges each.
InitMini GrosseGemeinde()
{
    InitMini d;
    d.AnzahlMinis = 32767;
    d.Minis.resize(32768);
    for (int i = 0; i < d.AnzahlMinis; ++i) {
        Mini &m = d.Minis[std::size_t(i)];
        m.Name = QStringLiteral("Müller-%1").arg(i);
        m.Vorname = QStringLiteral("Jörg");
        m.Strasse = QStringLiteral("Hauptstraße %1").arg(i % 200);
        m.Ort = QStringLiteral("12345 Großdorf");
        m.Telefon = QStringLiteral("0815/%1").arg(i);
        m.Ausgenommen[i % 7 + 1] = true;
        m.AnzahlTermine = 30;
        for (int t = 0; t < 30; ++t)
            m.Termine[std::size_t(t)] = t % 2 ? QStringLiteral("%1.03.2003-%1.04.2003").arg(t / 2 + 10)
                                              : QStringLiteral("%1.01.2003").arg(t / 2 + 10);
    }
    d.Sperre.assign(d.Minis.size(), 0);
    d.Einsaetze.assign(d.Minis.size(), 0);
    return d;
}

const InitMini &Daten()
{
    static const InitMini d = GrosseGemeinde();
    return d;
}

void BM_DateiSpeichern(benchmark::State &state)
{
    QTemporaryDir ordner;
    const QString pfad = ordner.filePath(QStringLiteral("gross.prd"));
    const InitMini &daten = Daten();   // built before the clock runs
    for (auto _ : state) {
        if (!SchreibeDatei(pfad, daten))
            state.SkipWithError("Speichern fehlgeschlagen");
    }
    state.counters["Bytes"] = double(QFile(pfad).size());
}

void BM_DateiLaden(benchmark::State &state)
{
    QTemporaryDir ordner;
    const QString pfad = ordner.filePath(QStringLiteral("gross.prd"));
    if (!SchreibeDatei(pfad, Daten())) {
        state.SkipWithError("Speichern fehlgeschlagen");
        return;
    }
    for (auto _ : state) {
        InitMini d;
        if (!LeseDatei(pfad, d) || d.AnzahlMinis != 32767)
            state.SkipWithError("Laden fehlgeschlagen");
        benchmark::DoNotOptimize(d.Minis.data());
    }
}

} // namespace

BENCHMARK(BM_DateiSpeichern)->Unit(benchmark::kMillisecond);
BENCHMARK(BM_DateiLaden)->Unit(benchmark::kMillisecond);
