#include "data/DatenDatei.h"

#include "data/Cp1252.h"
#include "data/InitMini.h"
#include "data/Meldungen.h"

#include <QFile>
#include <QSaveFile>

#include <algorithm>
#include <cstring>
#include <utility>

namespace {

const QByteArray Kennung = QByteArrayLiteral("pRaDiLoN");

// Lines shortest per record, to size storage by what the file can still hold rather than by
// the count it claims.
constexpr qsizetype ZeilenJeMini = 15;
constexpr qsizetype ZeilenJeAusnahme = 9;
constexpr qsizetype ZeilenJePlanEintrag = 4;

struct LeseAbbruch {
    QString grund;
};

// Splits the file bytes into lines: CR LF and a lone LF end a line; a last line without an end
// still counts.
class Zeilenleser
{
public:
    explicit Zeilenleser(const QByteArray &inhalt)
        : m_pos(inhalt.constData()), m_ende(inhalt.constData() + inhalt.size())
    {
    }

    int zeile() const { return m_zeile; }

    // An upper bound of the lines still to come: every line but the last takes a byte at least.
    qsizetype hoechstensZeilen() const { return m_ende - m_pos; }

    std::pair<const char *, qsizetype> naechste()
    {
        ++m_zeile;
        if (m_pos >= m_ende)
            throw LeseAbbruch{QStringLiteral("Datei endet vor der letzten Zeile")};
        const char *anfang = m_pos;
        const auto *lf = static_cast<const char *>(std::memchr(anfang, '\n', std::size_t(m_ende - anfang)));
        qsizetype laenge;
        if (lf) {
            laenge = lf - anfang;
            m_pos = lf + 1;
            if (laenge > 0 && anfang[laenge - 1] == '\r')
                --laenge;
        } else {
            laenge = m_ende - anfang;
            m_pos = m_ende;
        }
        return {anfang, laenge};
    }

    QString text()
    {
        const auto [daten, laenge] = naechste();
        return DekodiereCp1252(daten, laenge);
    }

    bool flag()
    {
        const auto [daten, laenge] = naechste();
        return laenge == 1 && daten[0] == 'T';
    }

    // Blanks around an optionally signed decimal whole number in the 16-bit range.
    int16_t zahl()
    {
        const auto [daten, laenge] = naechste();
        qsizetype i = 0;
        while (i < laenge && istBlank(daten[i]))
            ++i;
        bool negativ = false;
        if (i < laenge && (daten[i] == '+' || daten[i] == '-'))
            negativ = daten[i++] == '-';
        const qsizetype ziffernAnfang = i;
        long wert = 0;
        for (; i < laenge && daten[i] >= '0' && daten[i] <= '9'; ++i)
            wert = std::min(wert * 10 + (daten[i] - '0'), 100000L);
        const qsizetype ziffernEnde = i;
        while (i < laenge && istBlank(daten[i]))
            ++i;
        if (ziffernEnde == ziffernAnfang || i != laenge)
            throw LeseAbbruch{QStringLiteral("Keine Zahl")};
        if (negativ)
            wert = -wert;
        if (wert < -32768 || wert > 32767)
            throw LeseAbbruch{QStringLiteral("Zahl außerhalb von -32768..32767")};
        return static_cast<int16_t>(wert);
    }

private:
    static bool istBlank(char c) { return c == ' ' || c == '\t'; }

    const char *m_pos;
    const char *m_ende;
    int m_zeile = 0;
};

// Everything the file holds, read completely before it replaces anything in memory.
struct Gelesen {
    std::vector<Mini> Minis;
    int16_t AnzahlMinis = 0;
    std::array<RegulaererTag, 8> Regulaer;
    std::vector<AusnahmeSeite> Ausnahmen;
    int16_t AnzahlAusnahmen = 0;
    std::vector<PlanEintrag> Plan;
    int16_t AnzahlPlanEintraege = 0;
    int16_t Intervall = 0;
    bool Geschwister = false;
};

int16_t AnzahlOderFehler(Zeilenleser &leser, const char *was)
{
    const int16_t anzahl = leser.zahl();
    if (anzahl < 0)
        throw LeseAbbruch{QStringLiteral("Negative Anzahl ") + QString::fromUtf8(was)};
    return anzahl;
}

// Reserves at most what the rest of the file can hold; the vectors end with the spare element.
template<typename T>
void Vorbereiten(std::vector<T> &v, int16_t anzahl, const Zeilenleser &leser, qsizetype zeilenJeEintrag)
{
    v.clear();
    v.reserve(std::size_t(std::min<qsizetype>(anzahl, leser.hoechstensZeilen() / zeilenJeEintrag) + 1));
}

void LeseMini(Zeilenleser &leser, Mini &m)
{
    m.Name = leser.text();
    m.Vorname = leser.text();
    m.Strasse = leser.text();
    m.Ort = leser.text();
    m.Telefon = leser.text();
    m.Oberministrant = leser.flag();
    m.NichtEinteilen = leser.flag();
    for (int tag = 1; tag <= 7; ++tag)
        m.Ausgenommen[tag] = leser.flag();
    const int16_t termine = leser.zahl();
    if (termine > MaxTermine)
        throw LeseAbbruch{QStringLiteral("Mehr als 31 Termine")};
    m.AnzahlTermine = std::max<int16_t>(termine, 0);
    for (int i = 0; i < m.AnzahlTermine; ++i)
        m.Termine[i] = leser.text();
}

void LeseAusnahme(Zeilenleser &leser, AusnahmeSeite &a)
{
    a.Datum = leser.text();
    for (QString &zeit : a.Zeit)
        zeit = leser.text();
    for (QString &anzahl : a.MiniAnz)
        anzahl = leser.text();
}

void LesePlanEintrag(Zeilenleser &leser, PlanEintrag &p)
{
    p.Datum = leser.text();
    p.Wochentag = leser.text();
    p.Zeit = leser.text();
    const int16_t plaetze = leser.zahl();
    if (plaetze > MaxPlaetze)
        throw LeseAbbruch{QStringLiteral("Mehr als 41 Plätze")};
    p.MiniAnz = std::max<int16_t>(plaetze, 0);
    for (int j = 0; j < p.MiniAnz; ++j) {
        p.Name[j] = leser.text();
        p.Vorname[j] = leser.text();
    }
}

void LeseAlles(Zeilenleser &leser, Gelesen &g)
{
    const auto [kennung, laenge] = leser.naechste();
    if (QByteArray::fromRawData(kennung, laenge) != Kennung)
        throw LeseAbbruch{QStringLiteral("Falsche Kennung")};

    g.AnzahlMinis = AnzahlOderFehler(leser, "Minis");
    Vorbereiten(g.Minis, g.AnzahlMinis, leser, ZeilenJeMini);
    for (int i = 0; i < g.AnzahlMinis; ++i)
        LeseMini(leser, g.Minis.emplace_back());
    g.Minis.emplace_back();

    for (int tag = 1; tag <= 7; ++tag) {
        for (QString &zeit : g.Regulaer[tag].Zeit)
            zeit = leser.text();
        for (QString &anzahl : g.Regulaer[tag].MiniAnz)
            anzahl = leser.text();
    }

    g.AnzahlAusnahmen = AnzahlOderFehler(leser, "Ausnahmen");
    Vorbereiten(g.Ausnahmen, g.AnzahlAusnahmen, leser, ZeilenJeAusnahme);
    for (int i = 0; i < g.AnzahlAusnahmen; ++i)
        LeseAusnahme(leser, g.Ausnahmen.emplace_back());
    g.Ausnahmen.emplace_back();

    g.AnzahlPlanEintraege = AnzahlOderFehler(leser, "Planeinträge");
    Vorbereiten(g.Plan, g.AnzahlPlanEintraege, leser, ZeilenJePlanEintrag);
    for (int i = 0; i < g.AnzahlPlanEintraege; ++i)
        LesePlanEintrag(leser, g.Plan.emplace_back());
    g.Plan.emplace_back();

    g.Intervall = leser.zahl();
    g.Geschwister = leser.flag();
}

void Uebernehmen(Gelesen &&g, InitMini &ziel)
{
    ziel.Minis = std::move(g.Minis);
    ziel.AnzahlMinis = g.AnzahlMinis;
    ziel.Sperre.assign(ziel.Minis.size(), 0);
    ziel.Einsaetze.assign(ziel.Minis.size(), 0);
    ziel.Regulaer = std::move(g.Regulaer);
    ziel.Ausnahmen = std::move(g.Ausnahmen);
    ziel.AnzahlAusnahmen = g.AnzahlAusnahmen;
    ziel.Plan = std::move(g.Plan);
    ziel.AnzahlPlanEintraege = g.AnzahlPlanEintraege;
    ziel.Intervall = g.Intervall;
    ziel.Geschwister = g.Geschwister;
}

struct SchreibAbbruch {
    QString grund;
};

class Zeilenschreiber
{
public:
    explicit Zeilenschreiber(QByteArray &ziel) : m_ziel(ziel) {}

    void text(const QString &t)
    {
        // A line feed would end the line early and shift every later line of the file; a lone
        // carriage return is read back as part of the text.
        if (t.contains(u'\n'))
            throw SchreibAbbruch{QStringLiteral("Zeilenumbruch im Text: ") + t};
        if (!KodiereCp1252(t, m_ziel))
            throw SchreibAbbruch{QStringLiteral("Zeichen außerhalb von Windows-1252: ") + t};
        zeilenende();
    }

    void flag(bool f)
    {
        m_ziel.append(f ? 'T' : 'F');
        zeilenende();
    }

    // One leading blank (or the minus sign) and one trailing blank: " 12 ", "-3 ".
    void zahl(int wert)
    {
        char puffer[16];
        char *ende = puffer + sizeof puffer;
        char *p = ende;
        *--p = ' ';
        unsigned betrag = wert < 0 ? 0u - unsigned(wert) : unsigned(wert);
        do {
            *--p = char('0' + betrag % 10);
            betrag /= 10;
        } while (betrag);
        *--p = wert < 0 ? '-' : ' ';
        m_ziel.append(p, ende - p);
        zeilenende();
    }

private:
    void zeilenende() { m_ziel.append("\r\n", 2); }

    QByteArray &m_ziel;
};

void PruefeAnzahl(int anzahl, std::size_t vorhanden, const char *was)
{
    if (anzahl < 0 || std::size_t(anzahl) > vorhanden)
        throw SchreibAbbruch{QStringLiteral("Anzahl passt nicht zu den Daten: ") + QString::fromUtf8(was)};
}

void SchreibeAlles(const InitMini &d, Zeilenschreiber &s)
{
    PruefeAnzahl(d.AnzahlMinis, d.Minis.size(), "Minis");
    PruefeAnzahl(d.AnzahlAusnahmen, d.Ausnahmen.size(), "Ausnahmen");
    PruefeAnzahl(d.AnzahlPlanEintraege, d.Plan.size(), "Planeinträge");

    s.text(QString::fromLatin1(Kennung));
    s.zahl(d.AnzahlMinis);
    for (int i = 0; i < d.AnzahlMinis; ++i) {
        const Mini &m = d.Minis[std::size_t(i)];
        PruefeAnzahl(m.AnzahlTermine < 0 ? 0 : m.AnzahlTermine, m.Termine.size(), "Termine");
        s.text(m.Name);
        s.text(m.Vorname);
        s.text(m.Strasse);
        s.text(m.Ort);
        s.text(m.Telefon);
        s.flag(m.Oberministrant);
        s.flag(m.NichtEinteilen);
        for (int tag = 1; tag <= 7; ++tag)
            s.flag(m.Ausgenommen[tag]);
        s.zahl(m.AnzahlTermine);
        for (int t = 0; t < m.AnzahlTermine; ++t)
            s.text(m.Termine[std::size_t(t)]);
    }
    for (int tag = 1; tag <= 7; ++tag) {
        for (const QString &zeit : d.Regulaer[tag].Zeit)
            s.text(zeit);
        for (const QString &anzahl : d.Regulaer[tag].MiniAnz)
            s.text(anzahl);
    }
    s.zahl(d.AnzahlAusnahmen);
    for (int i = 0; i < d.AnzahlAusnahmen; ++i) {
        const AusnahmeSeite &a = d.Ausnahmen[std::size_t(i)];
        s.text(a.Datum);
        for (const QString &zeit : a.Zeit)
            s.text(zeit);
        for (const QString &anzahl : a.MiniAnz)
            s.text(anzahl);
    }
    s.zahl(d.AnzahlPlanEintraege);
    for (int i = 0; i < d.AnzahlPlanEintraege; ++i) {
        const PlanEintrag &p = d.Plan[std::size_t(i)];
        PruefeAnzahl(p.MiniAnz < 0 ? 0 : p.MiniAnz, p.Name.size(), "Plätze");
        s.text(p.Datum);
        s.text(p.Wochentag);
        s.text(p.Zeit);
        s.zahl(p.MiniAnz);
        for (int j = 0; j < p.MiniAnz; ++j) {
            s.text(p.Name[std::size_t(j)]);
            s.text(p.Vorname[std::size_t(j)]);
        }
    }
    s.zahl(d.Intervall);
    s.flag(d.Geschwister);
}

const QString LeseFehlerText = QStringLiteral("Dies ist keine Pradilon-Datei! ")
                               + QStringLiteral("Die Datei konnte nicht geöffnet werden! ");
const QString SchreibFehlerText = QStringLiteral("Dateiname oder Pfadangabe ungültig! ")
                                  + QStringLiteral("Datei konnte nicht gesichert werden.");

} // namespace

bool LeseDaten(const QByteArray &inhalt, InitMini &ziel, LeseFehler *fehler)
{
    Zeilenleser leser(inhalt);
    Gelesen gelesen;
    try {
        LeseAlles(leser, gelesen);
    } catch (const LeseAbbruch &abbruch) {
        if (fehler)
            *fehler = LeseFehler{leser.zeile(), abbruch.grund};
        return false;
    }
    Uebernehmen(std::move(gelesen), ziel);
    return true;
}

bool LeseDatei(const QString &pfad, InitMini &ziel, LeseFehler *fehler)
{
    QFile datei(pfad);
    if (!datei.open(QIODevice::ReadOnly)) {
        if (fehler)
            *fehler = LeseFehler{0, datei.errorString()};
        return false;
    }
    const QByteArray inhalt = datei.readAll();
    if (datei.error() != QFileDevice::NoError) {
        if (fehler)
            *fehler = LeseFehler{0, datei.errorString()};
        return false;
    }
    datei.close();
    return LeseDaten(inhalt, ziel, fehler);
}

bool SchreibeDaten(const InitMini &daten, QByteArray &ziel, QString *fehler)
{
    // About 12 bytes a line for a roster full of date ranges: one allocation for most files.
    ziel.reserve(ziel.size() + 1024 + qsizetype(daten.AnzahlMinis) * 400 + qsizetype(daten.AnzahlPlanEintraege) * 200);
    Zeilenschreiber schreiber(ziel);
    try {
        SchreibeAlles(daten, schreiber);
    } catch (const SchreibAbbruch &abbruch) {
        if (fehler)
            *fehler = abbruch.grund;
        return false;
    }
    return true;
}

bool SchreibeDatei(const QString &pfad, const InitMini &daten, QString *fehler)
{
    QByteArray inhalt;
    if (!SchreibeDaten(daten, inhalt, fehler))
        return false;

    QSaveFile datei(pfad);
    datei.setDirectWriteFallback(false);
    const bool ok = datei.open(QIODevice::WriteOnly) && datei.write(inhalt) == inhalt.size() && datei.flush()
                    && datei.commit();
    if (!ok) {
        if (fehler)
            *fehler = datei.errorString();
        datei.cancelWriting();
        return false;
    }
    return true;
}

bool Laden(InitMini &d, Meldungen &meldungen)
{
    if (LeseDatei(d.Dateiname, d))
        return true;
    meldungen.zeige(LeseFehlerText, Knoepfe::OK, Symbol::Kritisch, QStringLiteral("Fehler beim Öffnen"));
    d.Dateiname = d.AlterDateiname;
    return false;
}

SpeicherErgebnis Speichern(InitMini &d, Meldungen &meldungen, bool speichernUnter)
{
    if (!d.Geaendert)
        return SpeicherErgebnis::NichtsGeaendert;
    d.Geaendert = false;
    if (SchreibeDatei(d.Dateiname, d))
        return SpeicherErgebnis::Gespeichert;
    meldungen.zeige(SchreibFehlerText, Knoepfe::OK, Symbol::Kritisch, QStringLiteral("Fehler beim Sichern"));
    d.Geaendert = true;
    if (speichernUnter)
        d.Dateiname = d.AlterDateiname;
    return SpeicherErgebnis::Fehlgeschlagen;
}

QString Fenstertitel(const InitMini &d)
{
    return QStringLiteral("Ministrantenplan - ") + d.Dateiname.toUpper();
}
