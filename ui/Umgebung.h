#pragma once

#include <QString>

class Hilfe;
class Meldungen;
class Uhr;
class Zufall;

// What the windows take from outside: message boxes, clock, random source, help viewer and the
// program's folder. The program passes the real ones, tests pass scripted ones.
struct Umgebung {
    Meldungen &meldungen;
    const Uhr &uhr;
    Zufall &zufall;
    Hilfe &hilfe;
    QString programmOrdner;   // where the help file lies and where the file browser starts
};
