#pragma once

#include <QString>

struct InitMini;
class Drucker;
class Meldungen;
class Uhr;

// What the print dialog (or the command line) hands to the job: the texts of the font, size and
// spacing boxes and the two document check boxes.
struct DruckEinstellungen {
    QString schriftart;
    QString schriftgroesse;   // the job corrects an unusable size to "10"
    QString zeilenabstand = QStringLiteral("1");
    bool adressliste = true;
    bool plan = true;
};

enum class DruckErgebnis {
    Gedruckt,              // the document was ended, also when a part of it was refused
    Fehlgeschlagen,        // the printer service failed; the document was discarded
    DateiNichtGeschrieben  // the output file could not be written; nothing was left behind
};

// One print job: the address list and then the plan, drawn on the current printer of drucker.
// Every message goes through meldungen; a failure of the printer service is reported there too.
class Druckauftrag
{
public:
    Druckauftrag(Drucker &drucker, const InitMini &daten, Meldungen &meldungen, const Uhr &uhr);

    DruckErgebnis fuehreAus(DruckEinstellungen &einstellungen);

private:
    void bereiteVor(DruckEinstellungen &einstellungen);
    void PrinterInit();

    void druckeAdressliste(bool planFolgt);
    [[nodiscard]] bool adressSpaltenPassen();
    void druckeAdressZeile(int index);
    void setzeZeileFuerAdresse();

    void druckePlan();
    [[nodiscard]] bool planPasst(const QString &titel);

    Drucker &m_drucker;
    const InitMini &m_daten;
    Meldungen &m_meldungen;
    const Uhr &m_uhr;

    // Page geometry and line step, computed once by the preparation.
    float m_breite = 0;        // W
    float m_hoehe = 0;         // P
    float m_links = 0;         // L
    float m_oben = 0;          // T
    float m_zeilenHoehe = 0;   // H
    float m_schritt = 0;       // H x spacing factor

    // Address list columns wN, wV, wS, wT.
    float m_wN = 0;
    float m_wV = 0;
    float m_wS = 0;
    float m_wT = 0;

    float m_namensSpalte = 0;  // C of the plan
};
