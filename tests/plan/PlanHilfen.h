#pragma once

#include "data/InitMini.h"

#include <QDate>
#include <QString>

#include <initializer_list>

// Rosters and services for the plan tests.

// n servers "Vorname i" / "Name i" in streets of their own; arrays with the spare top element.
InitMini Gemeinde(int n);

// Sets the four regular slots of weekday tag (1 = Sonntag) to the given counts ("" for none),
// with the times "Zeit 1" .. "Zeit 4".
void SetzeRegulaer(InitMini &d, int tag, std::initializer_list<const char *> anzahlen);

// Every weekday gets the same slots.
void SetzeJedenTag(InitMini &d, std::initializer_list<const char *> anzahlen);

AusnahmeSeite Seite(const QString &datum, std::initializer_list<const char *> anzahlen);

QDate D(const char *text);   // dd.mm.yyyy
