#pragma once

#include <QDate>
#include <QString>

#include <cstdint>
#include <functional>
#include <vector>

struct InitMini;
class Meldungen;
class Uhr;
class Zufall;

// The plan computation behind "Erstellen" and the selection rules it uses (eligibility, the
// fewest-assignments rotation from a random start, siblings together, the interval). One object
// lives as long as the main window, because MemName and MemStrasse carry over between runs.
class PlanGenerator
{
public:
    PlanGenerator(InitMini &daten, Zufall &zufall);

    enum class Ergebnis {
        Fertig,       // plan complete, Geaendert set
        Abgelehnt,    // period refused or the question answered No; old plan kept
        Fehler        // "Fehler bei der Planberechnung" shown; entries made so far stay
    };

    // Computes a plan for the two typed texts. Messages and questions go through meldungen;
    // fortschritt receives the percentage after every day but the last.
    Ergebnis BtnErstellen_Click(const QString &startText, const QString &endText, Meldungen &meldungen,
                                const Uhr &uhr, const std::function<void(int)> &fortschritt = {});

    // The selection rules, public for tests. They throw Laufzeitfehler where the computation fails.
    bool Bedingungen(int16_t wahl);
    void ErmittleMinimum();
    void WaehleMini(int p);
    void BucheEinsatz();
    void ZaehleSperreHerunter();

    QDate AktDatum;
    QDate EndDatum;
    bool TerminGefunden = false;
    int16_t Wahl = 0;
    int16_t Minimum = 0;
    int16_t RingZaehler = 0;
    int16_t Zaehler = 0;
    bool gefunden = false;
    QString MemName;
    QString MemStrasse;

private:
    InitMini &d;
    Zufall &m_zufall;
    // (the implementation adds its caches here)
};
