#pragma once

#include <QDate>
#include <QString>

#include <optional>

// Dates as the German short form: read day.month.year with one- or two-digit day and month and
// a two- or four-digit year (00-29 -> 20xx, 30-99 -> 19xx), blanks around allowed; written as
// dd.mm.yyyy. Anything else, and impossible dates such as 31.02.2003, is not a date.
std::optional<QDate> LeseDatum(const QString &text);

// LeseDatum that throws Laufzeitfehler for a text that is no date.
QDate LeseDatumOderFehler(const QString &text);

QString DatumText(const QDate &datum);

// 1 = Sonntag .. 7 = Samstag.
int WochentagVon(const QDate &datum);
