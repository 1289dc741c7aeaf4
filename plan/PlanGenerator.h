#pragma once

#include <QDate>
#include <QHash>
#include <QString>

#include <cstdint>
#include <functional>
#include <utility>
#include <vector>

struct InitMini;
struct PlanEintrag;
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

    // The selection rules, public for tests. They throw Laufzeitfehler where the computation fails
    // (also for an index outside 0 .. AnzahlMinis - 1 or outside Minis, Sperre or Einsaetze).
    // Called from outside a computation they read the data afresh on every call.
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
    enum class Zustand : uint8_t { Frei, Gesperrt, Fehler };
    // How a server's excluded dates end: nothing unreadable, an unreadable entry after the
    // readable ones, or no record at all for the index.
    enum class TermineEnde : uint8_t { Gut, Fehler, KeinEintrag };
    struct Spanne {
        int32_t von;
        int32_t bis;
    };

    bool pruefe(int16_t wahl);
    void ermittleMinimum();
    void waehleMini(int p);
    bool waehleGeschwister();
    bool ohnePruefungen();
    void sucheSchnell();
    int16_t zufallsIndex(int n);
    int16_t einsaetze(int i) const;
    int16_t &sperre(int i);

    void planeTag();
    PlanEintrag &neuerEintrag();
    void leseTagesdienste();
    int sucheAusnahme() const;

    void cacheFuerAufruf();
    void bereiteMinisVor();
    void bereiteAusnahmenVor();
    void berechneTagesZustand();

    InitMini &d;
    Zufall &m_zufall;

    // Eligibility without re-reading texts: everything that does not change while a plan is
    // computed is read once; the state of every server for AktDatum is worked out once per day.
    // Sperre is always read live.
    bool m_imLauf = false;
    bool m_planBegonnen = false;
    bool m_minisBereit = false;
    int m_anzahl = 0;
    std::vector<uint8_t> m_wochentage;        // bit d: Ausgenommen(d)
    std::vector<uint8_t> m_nichtEinteilen;
    std::vector<uint32_t> m_spanneAb;         // m_spannen[m_spanneAb[i] .. m_spanneAb[i+1])
    std::vector<Spanne> m_spannen;            // readable ranges before the first unreadable entry, joined
    std::vector<uint32_t> m_zeiger;           // per server: first range not ending before m_zeigerTag
    qint64 m_zeigerTag = 0;
    std::vector<TermineEnde> m_termineEnde;
    bool m_eintraegeFehlen = false;
    QHash<std::pair<QString, QString>, int> m_familieNach;   // (Name, Strasse) -> m_familien index
    std::vector<std::vector<int16_t>> m_familien;            // members in index order
    std::vector<std::pair<QString, QString>> m_familienSchluessel;
    std::vector<int> m_familieVon;                           // per server

    bool m_zustandGueltig = false;
    qint64 m_zustandTag = 0;
    std::vector<Zustand> m_zustand;

    int m_ersteFehlerSeite = 0;               // first page the search cannot read past
    QHash<qint64, int> m_seiteNach;           // day -> first page of that date
};
