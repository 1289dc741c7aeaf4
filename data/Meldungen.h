#pragma once

#include <QString>

// Every message box of the program goes through this interface, so tests can script the answers
// and read what was shown. The window implementation uses QMessageBox; the command-line tool
// prints to standard error.
enum class Knoepfe { OK, OKAbbrechen, JaNeinAbbrechen, JaNein };
enum class Symbol { Keins, Kritisch, Ausrufezeichen, Information };
enum class Antwort { OK, Abbrechen, Ja, Nein };

class Meldungen
{
public:
    virtual ~Meldungen() = default;
    virtual Antwort zeige(const QString &text, Knoepfe knoepfe, Symbol symbol, const QString &titel) = 0;
};
