#include "plan/PlanGenerator.h"

#include "data/Datum.h"
#include "data/InitMini.h"
#include "data/Meldungen.h"
#include "data/Uhr.h"
#include "data/Werte.h"
#include "plan/Zufall.h"

#include <algorithm>
#include <climits>
#include <cmath>

namespace {

// The table of sibling candidates of one selection holds 11 servers.
constexpr int MaxGeschwister = 11;

void ZeigeFehler(Meldungen &meldungen)
{
    meldungen.zeige(QStringLiteral("Fehler unbekannten Typs, möglicherweise durch Fehler bei der Eingabe. "
                                   "Bitte kontrollieren Sie Ihre Eingaben."),
                    Knoepfe::OK, Symbol::Kritisch, QStringLiteral("Fehler bei der Planberechnung"));
}

int16_t TageDazwischen(const QDate &von, const QDate &bis)
{
    const qint64 tage = von.daysTo(bis);
    if (tage < -32768 || tage > 32767)
        throw Laufzeitfehler("Überlauf");
    return static_cast<int16_t>(tage);
}

// Sorts the ranges from index ab on and joins those that overlap or touch: only whether a day
// lies in any of them matters, not which one comes first.
template<typename Spanne>
void VereinigeSpannen(std::vector<Spanne> &spannen, std::size_t ab)
{
    std::sort(spannen.begin() + std::ptrdiff_t(ab), spannen.end(),
              [](const Spanne &a, const Spanne &b) { return a.von < b.von; });
    std::size_t ziel = ab;
    for (std::size_t i = ab; i < spannen.size(); ++i) {
        if (ziel > ab && spannen[i].von <= spannen[ziel - 1].bis + 1)
            spannen[ziel - 1].bis = std::max(spannen[ziel - 1].bis, spannen[i].bis);
        else
            spannen[ziel++] = spannen[i];
    }
    spannen.resize(ziel);
}

// Sets the flag for as long as a computation runs, so the selection rules keep their caches.
class Lauf
{
public:
    explicit Lauf(bool &imLauf) : m_imLauf(imLauf) { m_imLauf = true; }
    ~Lauf() { m_imLauf = false; }
    Lauf(const Lauf &) = delete;
    Lauf &operator=(const Lauf &) = delete;

private:
    bool &m_imLauf;
};

} // namespace

PlanGenerator::PlanGenerator(InitMini &daten, Zufall &zufall) : d(daten), m_zufall(zufall) {}

PlanGenerator::Ergebnis PlanGenerator::BtnErstellen_Click(const QString &startText, const QString &endText,
                                                          Meldungen &meldungen, const Uhr &uhr,
                                                          const std::function<void(int)> &fortschritt)
{
    m_minisBereit = false;
    m_zustandGueltig = false;
    m_planBegonnen = false;
    Lauf lauf(m_imLauf);
    try {
        AktDatum = LeseDatumOderFehler(startText);
        EndDatum = LeseDatumOderFehler(endText);
        const int16_t dauer = TageDazwischen(AktDatum, EndDatum);

        if (dauer < 0) {
            meldungen.zeige(QStringLiteral("Datum wurde falsch angegeben!"), Knoepfe::OK, Symbol::Kritisch,
                            QStringLiteral("Fehler im Datum"));
            return Ergebnis::Abgelehnt;
        }
        if (dauer > 100) {
            // The number is written with its leading blank, hence two blanks after "Dauer".
            const QString frage = QStringLiteral("Sie wollen einen Plan der Dauer  ") + QString::number(dauer)
                                  + QStringLiteral(" Tage berechnen. Ist dies korrekt?");
            if (meldungen.zeige(frage, Knoepfe::JaNein, Symbol::Keins, QStringLiteral("Planberechnung"))
                != Antwort::Ja)
                return Ergebnis::Abgelehnt;
        }
        if (dauer > 365) {
            meldungen.zeige(QStringLiteral("Planberechnung über ein Jahr macht keinen Sinn! \r\r\n"
                                           "Bitte wählen Sie die Zeitspanne kleiner!"),
                            Knoepfe::OK, Symbol::Kritisch, QStringLiteral("Zeitspanne zu groß"));
            return Ergebnis::Abgelehnt;
        }

        d.AnzahlPlanEintraege = 0;
        m_planBegonnen = true;
        d.Plan.reserve(std::size_t(dauer + 1) * 4);
        m_zufall.starte(static_cast<uint32_t>(uhr.jetzt().time().msecsSinceStartOfDay()));

        bereiteAusnahmenVor();
        const qint64 basis = dauer;
        qint64 erledigt = 0;
        for (;;) {
            planeTag();
            if (AktDatum == EndDatum)
                break;
            AktDatum = AktDatum.addDays(1);
            ++erledigt;
            if (fortschritt)
                fortschritt(static_cast<int>(100 * erledigt / basis));
        }
        d.Plan.resize(std::size_t(d.AnzahlPlanEintraege));
        d.Geaendert = true;
        return Ergebnis::Fertig;
    } catch (const Laufzeitfehler &) {
        if (m_planBegonnen)
            d.Plan.resize(std::size_t(d.AnzahlPlanEintraege));
        ZeigeFehler(meldungen);
        return Ergebnis::Fehler;
    }
}

// The entry at index AnzahlPlanEintraege - 1. Entries of the previous plan are reused rather
// than destroyed and built again, which is most of the cost of a plan for a small roster.
PlanEintrag &PlanGenerator::neuerEintrag()
{
    const std::size_t index = std::size_t(d.AnzahlPlanEintraege - 1);
    if (index >= d.Plan.size())
        return d.Plan.emplace_back();
    PlanEintrag &e = d.Plan[index];
    for (int j = 0, alt = std::clamp<int>(e.MiniAnz, 0, MaxPlaetze); j < alt; ++j) {
        e.Name[std::size_t(j)].clear();
        e.Vorname[std::size_t(j)].clear();
    }
    return e;
}

void PlanGenerator::planeTag()
{
    leseTagesdienste();
    const int wochentag = WochentagVon(AktDatum);
    const QString datumText = DatumText(AktDatum);
    for (int k = 1; k <= 4; ++k) {
        const int16_t anzahl = d.TagesMiniAnz[k];
        if (anzahl < 1)
            continue;
        const int16_t eintraege = Int16Summe(d.AnzahlPlanEintraege, 1);
        // Checked before the entry is added: an entry claiming more places than it holds would
        // be written to the data file and make that file unreadable.
        if (anzahl > MaxPlaetze)
            throw Laufzeitfehler("Zu viele Plätze");
        d.AnzahlPlanEintraege = eintraege;
        PlanEintrag &eintrag = neuerEintrag();
        eintrag.Datum = datumText;
        eintrag.Wochentag = d.Wochentag[wochentag];
        eintrag.Zeit = d.TagesZeit[k];
        eintrag.MiniAnz = anzahl;

        for (int p = 1; p <= anzahl; ++p) {
            waehleMini(p);
            if (!gefunden)
                break;
            BucheEinsatz();
            const Mini &mini = d.Minis[std::size_t(Wahl)];
            eintrag.Name[std::size_t(p - 1)] = mini.Name;
            eintrag.Vorname[std::size_t(p - 1)] = mini.Vorname;
        }
        ZaehleSperreHerunter();
    }
}

void PlanGenerator::leseTagesdienste()
{
    TerminGefunden = false;
    const int seite = sucheAusnahme();
    if (seite >= 0) {
        const AusnahmeSeite &a = d.Ausnahmen[std::size_t(seite)];
        for (int k = 1; k <= 4; ++k) {
            d.TagesMiniAnz[k] = RundeInt16OderFehler(ZahlWert(a.MiniAnz[k - 1]));
            d.TagesZeit[k] = a.Zeit[k - 1];
        }
        TerminGefunden = true;
        return;
    }
    const RegulaererTag &r = d.Regulaer[std::size_t(WochentagVon(AktDatum))];
    for (int k = 1; k <= 4; ++k) {
        d.TagesMiniAnz[k] = RundeInt16OderFehler(ZahlWert(r.MiniAnz[k - 1]));
        d.TagesZeit[k] = r.Zeit[k - 1];
    }
}

// The page search runs in index order; it fails on an unreadable page only if it gets there
// before the first page of the day.
int PlanGenerator::sucheAusnahme() const
{
    const int seite = m_seiteNach.value(AktDatum.toJulianDay(), INT_MAX);
    if (m_ersteFehlerSeite < seite)
        throw Laufzeitfehler("Kein Datum");
    return seite == INT_MAX ? -1 : seite;
}

void PlanGenerator::bereiteAusnahmenVor()
{
    m_seiteNach.clear();
    m_ersteFehlerSeite = INT_MAX;
    const int anzahl = d.AnzahlAusnahmen;
    for (int i = 0; i < anzahl; ++i) {
        if (std::size_t(i) >= d.Ausnahmen.size()) {
            m_ersteFehlerSeite = i;
            return;
        }
        const QString &text = d.Ausnahmen[std::size_t(i)].Datum;
        if (text.isEmpty())
            continue;
        const auto datum = LeseDatum(text);
        if (!datum) {
            m_ersteFehlerSeite = i;
            return;   // pages after it are never reached
        }
        m_seiteNach.insert(datum->toJulianDay(), std::min(i, m_seiteNach.value(datum->toJulianDay(), INT_MAX)));
    }
}

void PlanGenerator::cacheFuerAufruf()
{
    if (!m_imLauf) {
        m_minisBereit = false;
        m_zustandGueltig = false;
    }
}

void PlanGenerator::bereiteMinisVor()
{
    const int n = std::max<int>(d.AnzahlMinis, 0);
    m_anzahl = n;
    m_wochentage.assign(std::size_t(n), 0);
    m_nichtEinteilen.assign(std::size_t(n), 0);
    m_spanneAb.assign(std::size_t(n) + 1, 0);
    m_spannen.clear();
    m_termineEnde.assign(std::size_t(n), TermineEnde::Gut);
    m_familieNach.clear();
    m_familien.clear();
    m_familienSchluessel.clear();
    m_familieVon.assign(std::size_t(n), -1);
    m_eintraegeFehlen = false;

    for (int i = 0; i < n; ++i) {
        m_spanneAb[std::size_t(i)] = uint32_t(m_spannen.size());
        if (std::size_t(i) >= d.Minis.size()) {
            m_termineEnde[std::size_t(i)] = TermineEnde::KeinEintrag;
            m_eintraegeFehlen = true;
            continue;
        }
        const Mini &mini = d.Minis[std::size_t(i)];
        uint8_t maske = 0;
        for (int tag = 1; tag <= 7; ++tag)
            maske |= mini.Ausgenommen[std::size_t(tag)] ? uint8_t(1u << tag) : 0;
        m_wochentage[std::size_t(i)] = maske;
        m_nichtEinteilen[std::size_t(i)] = mini.NichtEinteilen;

        for (int k = 0; k < mini.AnzahlTermine; ++k) {
            if (k >= MaxTermine) {
                m_termineEnde[std::size_t(i)] = TermineEnde::Fehler;
                break;
            }
            const QString &text = mini.Termine[std::size_t(k)];
            if (text.isEmpty())
                continue;
            const qsizetype strich = text.indexOf(u'-');
            std::optional<QDate> von;
            std::optional<QDate> bis;
            if (strich >= 0) {
                von = LeseDatum(text.left(strich));
                bis = LeseDatum(text.mid(strich + 1));
            } else {
                von = bis = LeseDatum(text);
            }
            if (!von || !bis) {
                // Later entries are never reached: an earlier one excludes the day or this one fails.
                m_termineEnde[std::size_t(i)] = TermineEnde::Fehler;
                break;
            }
            if (*von <= *bis)
                m_spannen.push_back({int32_t(von->toJulianDay()), int32_t(bis->toJulianDay())});
        }

        VereinigeSpannen(m_spannen, m_spanneAb[std::size_t(i)]);

        const std::pair<QString, QString> schluessel(mini.Name, mini.Strasse);
        auto it = m_familieNach.constFind(schluessel);
        if (it == m_familieNach.cend()) {
            it = m_familieNach.insert(schluessel, int(m_familien.size()));
            m_familien.emplace_back();
            m_familienSchluessel.push_back(schluessel);
        }
        m_familien[std::size_t(*it)].push_back(int16_t(i));
        m_familieVon[std::size_t(i)] = *it;
    }
    m_spanneAb[std::size_t(n)] = uint32_t(m_spannen.size());
    m_zeiger.assign(m_spanneAb.begin(), m_spanneAb.end() - 1);
    m_zeigerTag = LLONG_MIN;
    m_zustand.assign(std::size_t(n), Zustand::Frei);
    m_zustandGueltig = false;
    m_minisBereit = true;
}

void PlanGenerator::berechneTagesZustand()
{
    if (!m_minisBereit)
        bereiteMinisVor();
    const qint64 tag = AktDatum.toJulianDay();
    // The days of a computation only grow, so each server's cursor into its sorted ranges only
    // moves forward. Calls from outside a computation rebuild everything anyway; this guards
    // against AktDatum being set back while a computation keeps its caches.
    if (tag < m_zeigerTag)
        std::copy(m_spanneAb.begin(), m_spanneAb.end() - 1, m_zeiger.begin());
    m_zeigerTag = tag;
    const uint8_t wochentagBit = uint8_t(1u << WochentagVon(AktDatum));
    for (int i = 0; i < m_anzahl; ++i) {
        const std::size_t s = std::size_t(i);
        const uint32_t ende = m_spanneAb[s + 1];
        uint32_t &zeiger = m_zeiger[s];
        while (zeiger < ende && m_spannen[zeiger].bis < tag)
            ++zeiger;
        const bool inSpanne = zeiger < ende && m_spannen[zeiger].von <= tag;

        Zustand z = Zustand::Frei;
        if (m_termineEnde[s] == TermineEnde::KeinEintrag)
            z = Zustand::Fehler;
        else if ((m_wochentage[s] & wochentagBit) || inSpanne)
            z = Zustand::Gesperrt;
        else if (m_termineEnde[s] == TermineEnde::Fehler)
            z = Zustand::Fehler;
        else if (m_nichtEinteilen[s])
            z = Zustand::Gesperrt;
        m_zustand[s] = z;
    }
    m_zustandTag = tag;
    m_zustandGueltig = true;
}

int16_t PlanGenerator::einsaetze(int i) const
{
    if (i < 0 || std::size_t(i) >= d.Einsaetze.size())
        throw Laufzeitfehler("Index");
    return d.Einsaetze[std::size_t(i)];
}

int16_t &PlanGenerator::sperre(int i)
{
    if (i < 0 || std::size_t(i) >= d.Sperre.size())
        throw Laufzeitfehler("Index");
    return d.Sperre[std::size_t(i)];
}

int16_t PlanGenerator::zufallsIndex(int n)
{
    const double z = m_zufall.naechste();
    if (n <= 0)
        return 0;
    const int r = static_cast<int>(std::floor(z * n));
    return static_cast<int16_t>(std::clamp(r, 0, n - 1));
}

bool PlanGenerator::Bedingungen(int16_t wahl)
{
    cacheFuerAufruf();
    return pruefe(wahl);
}

bool PlanGenerator::pruefe(int16_t wahl)
{
    if (wahl < 0 || wahl >= d.AnzahlMinis)
        throw Laufzeitfehler("Index");
    if (!m_minisBereit || !m_zustandGueltig || m_zustandTag != AktDatum.toJulianDay())
        berechneTagesZustand();
    switch (m_zustand[std::size_t(wahl)]) {
    case Zustand::Fehler:
        throw Laufzeitfehler("Kein Datum");
    case Zustand::Gesperrt:
        return false;
    case Zustand::Frei:
        break;
    }
    return sperre(wahl) <= 0;
}

void PlanGenerator::ErmittleMinimum()
{
    cacheFuerAufruf();
    ermittleMinimum();
}

void PlanGenerator::ermittleMinimum()
{
    Zaehler = 0;
    Minimum = 0;
    gefunden = false;
    while (Zaehler < d.AnzahlMinis) {
        ++Zaehler;
        if (pruefe(Wahl)) {
            Minimum = einsaetze(Wahl);
            gefunden = true;
            return;
        }
        Wahl = static_cast<int16_t>((Wahl + 1) % d.AnzahlMinis);
    }
}

void PlanGenerator::WaehleMini(int p)
{
    cacheFuerAufruf();
    waehleMini(p);
}

void PlanGenerator::waehleMini(int p)
{
    const bool geschwister = d.Geschwister && p > 1 && waehleGeschwister();
    if (!geschwister)
        Wahl = zufallsIndex(d.AnzahlMinis);
    if (ohnePruefungen()) {
        sucheSchnell();
        return;
    }
    ermittleMinimum();

    RingZaehler = Wahl;
    while (Zaehler < d.AnzahlMinis) {
        ++Zaehler;
        RingZaehler = static_cast<int16_t>((RingZaehler + 1) % d.AnzahlMinis);
        // Both are read for every server passed, as an index failure of either must surface.
        const bool frei = pruefe(RingZaehler);
        const int16_t anzahl = einsaetze(RingZaehler);
        if (frei && anzahl < Minimum) {
            Wahl = RingZaehler;
            Minimum = anzahl;
        }
    }
}

// Whether every index the search can reach is valid, so the search may skip the index checks.
bool PlanGenerator::ohnePruefungen()
{
    const int n = d.AnzahlMinis;
    if (n <= 0 || Wahl < 0 || Wahl >= n || d.Sperre.size() < std::size_t(n) || d.Einsaetze.size() < std::size_t(n))
        return false;
    if (!m_minisBereit || !m_zustandGueltig || m_zustandTag != AktDatum.toJulianDay())
        berechneTagesZustand();
    return true;
}

// ErmittleMinimum and the ring scan on today's states, with the same steps, results and
// point of failure, but without a call, an index check or a division per server.
void PlanGenerator::sucheSchnell()
{
    const int n = d.AnzahlMinis;
    const Zustand *zustand = m_zustand.data();
    const int16_t *sperre = d.Sperre.data();
    const int16_t *einsaetze = d.Einsaetze.data();

    int wahl = Wahl;
    int zaehler = 0;
    int ring = 0;
    int16_t minimum = 0;
    gefunden = false;
    // Leaves the selection state as the plain search would have it at its failing check.
    auto scheitere = [&](bool imRing) {
        Wahl = int16_t(wahl);
        Zaehler = int16_t(zaehler);
        Minimum = minimum;
        if (imRing)
            RingZaehler = int16_t(ring);
        throw Laufzeitfehler("Kein Datum");
    };

    while (zaehler < n) {
        ++zaehler;
        const Zustand z = zustand[wahl];
        if (z == Zustand::Fehler)
            scheitere(false);
        if (z == Zustand::Frei && sperre[wahl] <= 0) {
            minimum = einsaetze[wahl];
            gefunden = true;
            break;
        }
        wahl = wahl + 1 == n ? 0 : wahl + 1;
    }

    ring = wahl;
    while (zaehler < n) {
        ++zaehler;
        ring = ring + 1 == n ? 0 : ring + 1;
        const Zustand z = zustand[ring];
        if (z == Zustand::Frei) {
            if (sperre[ring] <= 0 && einsaetze[ring] < minimum) {
                wahl = ring;
                minimum = einsaetze[ring];
            }
        } else if (z == Zustand::Fehler) {
            scheitere(true);
        }
    }
    Wahl = int16_t(wahl);
    Zaehler = int16_t(zaehler);
    RingZaehler = int16_t(ring);
    Minimum = minimum;
}

// Starts the search at a random sibling (same Name and Strasse as the server assigned last) if
// one of them is eligible.
bool PlanGenerator::waehleGeschwister()
{
    if (!m_minisBereit)
        bereiteMinisVor();
    if (m_eintraegeFehlen)
        throw Laufzeitfehler("Index");   // collecting reads the name of every server
    // MemName and MemStrasse normally are those of Wahl, whose family is known; look them up only
    // when they were set otherwise.
    int familienIndex = Wahl >= 0 && Wahl < m_anzahl ? m_familieVon[std::size_t(Wahl)] : -1;
    if (familienIndex < 0 || m_familienSchluessel[std::size_t(familienIndex)].first != MemName
        || m_familienSchluessel[std::size_t(familienIndex)].second != MemStrasse) {
        const auto it = m_familieNach.constFind(std::pair<QString, QString>(MemName, MemStrasse));
        if (it == m_familieNach.cend())
            return false;
        familienIndex = *it;
    }
    const std::vector<int16_t> &familie = m_familien[std::size_t(familienIndex)];
    int16_t kandidaten[MaxGeschwister];
    int n = 0;
    for (const int16_t i : familie) {
        if (i == Wahl)
            continue;
        if (n == MaxGeschwister)
            throw Laufzeitfehler("Zu viele Geschwister");
        kandidaten[n++] = i;
    }
    if (n == 0)
        return false;
    int r = zufallsIndex(n);
    for (int versuch = 0; versuch <= n; ++versuch) {
        if (pruefe(kandidaten[r])) {
            Wahl = kandidaten[r];
            return true;
        }
        r = (r + 1) % n;
    }
    return false;
}

void PlanGenerator::BucheEinsatz()
{
    const int16_t neu = Int16Summe(einsaetze(Wahl), 1);
    d.Einsaetze[std::size_t(Wahl)] = neu;
    if (std::size_t(Wahl) >= d.Minis.size())
        throw Laufzeitfehler("Index");
    MemName = d.Minis[std::size_t(Wahl)].Name;
    MemStrasse = d.Minis[std::size_t(Wahl)].Strasse;
    // A negative interval from a hand-made file would otherwise let a server fill two places
    // of one service.
    sperre(Wahl) = Int16Summe(std::max<int>(d.Intervall, 0), 1);
}

void PlanGenerator::ZaehleSperreHerunter()
{
    if (d.Sperre.size() >= std::size_t(std::max<int>(d.AnzahlMinis, 0))) {
        for (auto s = d.Sperre.begin(), ende = s + std::max<int>(d.AnzahlMinis, 0); s != ende; ++s) {
            if (*s > 0)
                --*s;
        }
        return;
    }
    for (int i = 0; i < d.AnzahlMinis; ++i) {
        int16_t &s = sperre(i);
        if (s > 0)
            --s;
    }
}
