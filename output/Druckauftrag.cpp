#include "output/Druckauftrag.h"

#include "data/Datum.h"
#include "data/InitMini.h"
#include "data/Meldungen.h"
#include "data/Uhr.h"
#include "data/Werte.h"
#include "output/Drucker.h"

#include <algorithm>
#include <exception>

namespace {

const QString SpaltenAbstand = QStringLiteral("  ");
const QString TitelFehler = QStringLiteral("Fehler beim Drucken");
const QString SchriftZuGross = QStringLiteral("da die Schrift zu groß gewählt wurde!");

QString PlanTitel(const InitMini &d)
{
    return QStringLiteral("Ministrantenplan vom ") + d.Plan.at(0).Datum + QStringLiteral(" bis ")
        + d.Plan.at(d.AnzahlPlanEintraege - 1).Datum;
}

QString Ueberschrift(const PlanEintrag &e)
{
    return e.Wochentag + QStringLiteral(", den ") + e.Datum + QStringLiteral(", ") + e.Zeit
        + QStringLiteral(" Uhr: ");
}

QString MiniZeile(const PlanEintrag &e, int k)
{
    return e.Vorname.at(k) + QLatin1Char(' ') + e.Name.at(k);
}

} // namespace

Druckauftrag::Druckauftrag(Drucker &drucker, const InitMini &daten, Meldungen &meldungen, const Uhr &uhr)
    : m_drucker(drucker), m_daten(daten), m_meldungen(meldungen), m_uhr(uhr)
{
}

DruckErgebnis Druckauftrag::fuehreAus(DruckEinstellungen &einstellungen)
{
    try {
        bereiteVor(einstellungen);
        if (m_daten.AnzahlMinis >= 1 && einstellungen.adressliste)
            druckeAdressliste(einstellungen.plan);
        PrinterInit();
        if (m_daten.AnzahlPlanEintraege >= 1 && m_daten.AnzahlMinis >= 1 && einstellungen.plan)
            druckePlan();
        m_drucker.beendeDokument();
        return DruckErgebnis::Gedruckt;
    } catch (const DruckerFehler &f) {
        m_drucker.verwerfeDokument();
        if (f.art() == DruckerFehler::Art::Datei) {
            m_meldungen.zeige(QStringLiteral("Datei ") + f.pfad() + QStringLiteral(" konnte nicht geschrieben werden."),
                              Knoepfe::OK, Symbol::Kritisch, QStringLiteral("Als PDF speichern"));
            return DruckErgebnis::DateiNichtGeschrieben;
        }
    } catch (const std::exception &) {
        // A record outside its bounds is as fatal for the document as a failing printer.
        m_drucker.verwerfeDokument();
    }
    m_meldungen.zeige(QStringLiteral("Der Drucker meldet einen Fehler. Das Dokument wurde verworfen."),
                      Knoepfe::OK, Symbol::Kritisch, TitelFehler);
    return DruckErgebnis::Fehlgeschlagen;
}

void Druckauftrag::bereiteVor(DruckEinstellungen &einstellungen)
{
    m_drucker.setzeEinheitPixel();
    m_drucker.setzeSchriftName(einstellungen.schriftart);

    m_breite = float(m_drucker.seitenBreite());
    m_hoehe = float(m_drucker.seitenHoehe());
    m_links = m_breite / 10;
    m_oben = m_hoehe / 40;
    // Clamped only so that an absurd typed spacing stays a number in single precision.
    const float abstand = float(std::clamp(ZahlWert(einstellungen.zeilenabstand), -1e6, 1e6));

    double groesse = ZahlWert(einstellungen.schriftgroesse);
    if (!(groesse >= 8 && groesse <= 20)) {
        einstellungen.schriftgroesse = QStringLiteral("10");
        m_meldungen.zeige(QStringLiteral("Schriftgröße nicht durchführbar! ") + QStringLiteral("Korrigiere auf 10."),
                          Knoepfe::OK, Symbol::Ausrufezeichen, QStringLiteral("Falsche Schriftgröße"));
        groesse = 10;
    }
    // Every whole size first, so that a printer which only offers some sizes still ends on
    // the one asked for.
    for (int s = 8; s <= 20; ++s)
        m_drucker.setzeSchriftGroesse(s);
    m_drucker.setzeSchriftGroesse(float(groesse));

    m_zeilenHoehe = float(m_drucker.textHoehe(QString()));
    m_schritt = m_zeilenHoehe * abstand;
    PrinterInit();
}

void Druckauftrag::PrinterInit()
{
    m_drucker.druckeZeile(QString());
}

bool Druckauftrag::adressSpaltenPassen()
{
    m_wN = m_wV = m_wS = m_wT = 0;
    for (int i = 0; i < m_daten.AnzahlMinis; ++i) {
        const Mini &m = m_daten.Minis.at(i);
        m_wN = std::max(m_wN, float(m_drucker.textBreite(m.Name + SpaltenAbstand)));
        m_wV = std::max(m_wV, float(m_drucker.textBreite(m.Vorname + SpaltenAbstand)));
        m_wS = std::max(m_wS, float(m_drucker.textBreite(m.Strasse + SpaltenAbstand)));
        m_wT = std::max(m_wT, float(m_drucker.textBreite(m.Telefon + SpaltenAbstand)));
    }
    return m_wN + m_wV + m_wS + m_wT <= m_breite - 2 * m_links;
}

void Druckauftrag::druckeAdressliste(bool planFolgt)
{
    if (!adressSpaltenPassen()) {
        m_meldungen.zeige(QStringLiteral("Adressliste kann nicht gedruckt werden, ") + SchriftZuGross,
                          Knoepfe::OK, Symbol::Kritisch, TitelFehler);
        return;
    }

    m_drucker.setzeX(m_links);
    m_drucker.setzeY(m_oben);
    m_drucker.setzeFett(true);
    m_drucker.drucke(QStringLiteral("Adressverzeichnis aller Ministranten") + SpaltenAbstand + QStringLiteral("(Stand ")
                     + DatumText(m_uhr.jetzt().date()) + QLatin1Char(')'));
    m_drucker.setzeFett(false);
    m_drucker.setzeY(m_drucker.y() + m_schritt);

    for (int i = 0; i < m_daten.AnzahlMinis; ++i) {
        if (!m_daten.Minis.at(i).Oberministrant)
            druckeAdressZeile(i);
    }

    // The heading may use the page down to its edge (the rows keep a bottom margin), but it must
    // end on the page: with a wide spacing two line steps would otherwise put it below the edge.
    if (m_drucker.y() + 2 * m_schritt + m_zeilenHoehe <= m_hoehe) {
        m_drucker.setzeY(m_drucker.y() + 2 * m_schritt);
    } else {
        m_drucker.neueSeite();
        PrinterInit();
        m_drucker.setzeY(m_oben);
    }
    m_drucker.setzeX(m_links);
    m_drucker.setzeFett(true);
    m_drucker.drucke(QStringLiteral("Oberministranten"));
    m_drucker.setzeFett(false);
    m_drucker.setzeY(m_drucker.y() + m_schritt);

    for (int i = 0; i < m_daten.AnzahlMinis; ++i) {
        if (m_daten.Minis.at(i).Oberministrant)
            druckeAdressZeile(i);
    }

    if (planFolgt)
        m_drucker.neueSeite();
}

void Druckauftrag::setzeZeileFuerAdresse()
{
    if (m_drucker.y() + 2 * m_schritt <= m_hoehe - 2 * m_oben) {
        m_drucker.setzeY(m_drucker.y() + m_schritt);
    } else {
        m_drucker.neueSeite();
        PrinterInit();
        m_drucker.setzeX(m_links);
        m_drucker.setzeY(m_oben);
    }
}

void Druckauftrag::druckeAdressZeile(int index)
{
    const Mini &m = m_daten.Minis.at(index);
    setzeZeileFuerAdresse();
    m_drucker.setzeX(m_links);
    m_drucker.drucke(m.Name);
    m_drucker.setzeX(m_links + m_wN);
    m_drucker.drucke(m.Vorname);
    m_drucker.setzeX(m_links + m_wN + m_wV);
    m_drucker.drucke(m.Strasse);
    m_drucker.setzeX(m_links + m_wN + m_wV + m_wS);
    m_drucker.drucke(m.Telefon);
}

bool Druckauftrag::planPasst(const QString &titel)
{
    const float verfuegbar = m_breite - 2 * m_links;
    if (m_drucker.textBreite(titel) > verfuegbar)
        return false;

    m_namensSpalte = 0;
    for (int i = 0; i < m_daten.AnzahlPlanEintraege; ++i)
        m_namensSpalte = std::max(m_namensSpalte, float(m_drucker.textBreite(Ueberschrift(m_daten.Plan.at(i)))));

    for (int i = 0; i < m_daten.AnzahlPlanEintraege; ++i) {
        const PlanEintrag &e = m_daten.Plan.at(i);
        const QString kopf = Ueberschrift(e);
        for (int k = 0; k < e.MiniAnz; ++k) {
            if (m_drucker.textBreite(kopf + MiniZeile(e, k)) > verfuegbar)
                return false;
        }
    }
    return true;
}

void Druckauftrag::druckePlan()
{
    const QString titel = PlanTitel(m_daten);
    if (!planPasst(titel)) {
        m_meldungen.zeige(QStringLiteral("Plan kann nicht gedruckt werden, ") + SchriftZuGross,
                          Knoepfe::OK, Symbol::Kritisch, TitelFehler);
        return;
    }

    m_drucker.setzeX(m_links);
    m_drucker.setzeY(m_oben);
    m_drucker.setzeFett(true);
    m_drucker.drucke(titel);
    m_drucker.setzeFett(false);
    m_drucker.setzeX(m_links);
    m_drucker.setzeY(m_drucker.y() + 3 * m_schritt);

    for (int i = 0; i < m_daten.AnzahlPlanEintraege; ++i) {
        const PlanEintrag &e = m_daten.Plan.at(i);
        if (m_drucker.y() + (e.MiniAnz + 1) * m_schritt > m_hoehe) {
            m_drucker.neueSeite();
            PrinterInit();
            m_drucker.setzeY(m_oben);
        }
        m_drucker.setzeKursiv(true);
        m_drucker.setzeX(m_links);
        m_drucker.drucke(Ueberschrift(e));
        m_drucker.setzeKursiv(false);
        for (int k = 0; k < e.MiniAnz; ++k) {
            // Only a service too long for a whole page gets here; its names go on overleaf
            // instead of running off the sheet.
            if (k > 0 && m_drucker.y() + m_zeilenHoehe > m_hoehe) {
                m_drucker.neueSeite();
                PrinterInit();
                m_drucker.setzeY(m_oben);
            }
            m_drucker.setzeX(m_links + m_namensSpalte);
            m_drucker.drucke(MiniZeile(e, k));
            m_drucker.setzeY(m_drucker.y() + m_schritt);
        }
        if (m_drucker.y() + m_schritt <= m_hoehe)
            m_drucker.setzeY(m_drucker.y() + m_schritt);
    }
    m_drucker.neueSeite();
}
