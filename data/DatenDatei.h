#pragma once

#include <QByteArray>
#include <QString>

struct InitMini;
class Meldungen;

// Reading and writing the .prd data file (the line table of the data file format).

struct LeseFehler {
    int zeile = 0;      // 1-based line at which reading failed (0: the file could not be opened)
    QString grund;      // for tests and the command-line tool; the user sees the fixed message
};

// Reads pfad into ziel. The data goes into separate storage first and replaces the roster,
// services, pages, plan and settings of ziel only after the last line has been read, with
// Sperre and Einsaetze reset to 0; on failure ziel is untouched and fehler says where.
// A negative AnzahlTermine or MiniAnz means no entries and is stored as 0, so that no later
// code indexes with it.
[[nodiscard]] bool LeseDatei(const QString &pfad, InitMini &ziel, LeseFehler *fehler = nullptr);

// LeseDatei on the bytes of a whole file already in memory.
[[nodiscard]] bool LeseDaten(const QByteArray &inhalt, InitMini &ziel, LeseFehler *fehler = nullptr);

// The bytes of the data file for daten, appended to ziel. Fails when a text holds a character
// outside Windows-1252 or a count does not fit the arrays it counts.
[[nodiscard]] bool SchreibeDaten(const InitMini &daten, QByteArray &ziel, QString *fehler = nullptr);

// Writes daten to pfad through a temporary file in the same folder that replaces pfad only when
// everything was written: a failure never damages an existing file. Fails also when a text holds
// a character outside Windows-1252.
[[nodiscard]] bool SchreibeDatei(const QString &pfad, const InitMini &daten, QString *fehler = nullptr);

// The procedures Laden and Speichern of the main window without their window parts (title,
// toolbar image, menus), so the windows and the command-line tool share one path.

// Reads Dateiname. On failure shows "Fehler beim Öffnen", sets Dateiname back to AlterDateiname
// and returns false; the data stays as it was.
[[nodiscard]] bool Laden(InitMini &d, Meldungen &meldungen);

enum class SpeicherErgebnis { NichtsGeaendert, Gespeichert, Fehlgeschlagen };

// Writes Dateiname if Geaendert. On failure shows "Fehler beim Sichern", keeps Geaendert true and
// sets Dateiname back to AlterDateiname only when saving under a new name (speichernUnter).
SpeicherErgebnis Speichern(InitMini &d, Meldungen &meldungen, bool speichernUnter);

// "Ministrantenplan - " + Dateiname in capitals.
QString Fenstertitel(const InitMini &d);
