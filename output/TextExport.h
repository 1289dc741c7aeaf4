#pragma once

#include <QDate>
#include <QString>
#include <QStringList>

struct InitMini;
class Meldungen;

// PLAN.TXT and ADRESS.TXT: their lines, where they go and how they are written.

// The folder of dateiname (up to and including its last separator: a slash, on Windows also a backslash)
// followed by name.
QString PfadNebenDatei(const QString &dateiname, const QString &name);

// The lines of the plan, also shown by the plan view. Empty when there is no plan.
QStringList PlanZeilen(const InitMini &d);
QStringList AdressZeilen(const InitMini &d, const QDate &heute);

// Windows-1252 with CR LF after every line, through a temporary file. False when the file cannot
// be written or a character has no byte in the code page; the old file then stays as it was.
[[nodiscard]] bool SchreibeTextDatei(const QString &pfad, const QStringList &zeilen, QString *fehler = nullptr);

enum class ExportErgebnis { Abgebrochen, NichtsZuSchreiben, Geschrieben, Fehlgeschlagen };

// The two menu commands without their menu: confirmation, writing, failure message. Without a
// path the file goes next to Dateiname; the command-line tool may name another target. The plan
// is written only with at least one entry (NichtsZuSchreiben otherwise, after the confirmation).
ExportErgebnis PlanAlsTextSpeichern(const InitMini &d, Meldungen &meldungen);
ExportErgebnis PlanAlsTextSpeichern(const InitMini &d, Meldungen &meldungen, const QString &pfad);
ExportErgebnis AdresslisteAlsTextSpeichern(const InitMini &d, Meldungen &meldungen, const QDate &heute);
ExportErgebnis AdresslisteAlsTextSpeichern(const InitMini &d, Meldungen &meldungen, const QDate &heute,
                                           const QString &pfad);
