#pragma once

#include "data/Meldungen.h"

#include <QHash>
#include <QString>
#include <QStringList>

#include <initializer_list>
#include <optional>
#include <vector>

struct InitMini;

// Exit codes of pradilon-cli.
enum Ausgang : int {
    Erfolg = 0,
    NichtGeladen = 1,
    ZeitraumAbgelehnt = 2,
    Rechenfehler = 3,
    NichtsZuSchreiben = 4,
    NichtGeschrieben = 5,
    FalscherAufruf = 64
};

// One command: its name, its synopsis, what it does, and the function that runs it with the
// arguments after the command name. "--help" never reaches the function.
struct Befehl {
    const char *name;
    const char *aufruf;
    const char *hilfe;
    int (*ausfuehren)(const QStringList &argumente);
};

// Every command, in the order the overview lists them. A further command is a function in a file
// of its own, declared below, and one line in the table in Befehle.cpp.
const std::vector<Befehl> &AlleBefehle();

int InfoBefehl(const QStringList &argumente);
int SaveBefehl(const QStringList &argumente);
int PlanBefehl(const QStringList &argumente);
int PlanTextBefehl(const QStringList &argumente);
int AdressenTextBefehl(const QStringList &argumente);
int DruckBefehl(const QStringList &argumente);

// Message boxes of the core as lines "title: text" on standard error; every question is
// answered with Yes or OK.
class CliMeldungen : public Meldungen
{
public:
    Antwort zeige(const QString &text, Knoepfe knoepfe, Symbol symbol, const QString &titel) override;
};

// Splits the arguments of one command into positional ones and options that take a value.
class Argumente
{
public:
    Argumente(const QStringList &roh, std::initializer_list<const char *> optionenMitWert);

    bool gueltig() const { return m_fehler.isEmpty(); }
    const QString &fehler() const { return m_fehler; }
    const QStringList &positionen() const { return m_positionen; }
    std::optional<QString> option(const char *name) const;

private:
    QStringList m_positionen;
    QHash<QString, QString> m_optionen;
    QString m_fehler;
};

void SchreibeAus(const QString &text);       // standard output, UTF-8
void SchreibeFehler(const QString &text);    // standard error, UTF-8

// Prints the reason and the command's synopsis to standard error; returns FalscherAufruf.
int Verwendungsfehler(const char *befehl, const QString &grund);

// The arguments of befehl when they parse and hold exactly `anzahl` positional ones (named by
// erwartet); otherwise the usage error is printed and nothing is returned.
std::optional<Argumente> LeseAufruf(const char *befehl, const QStringList &roh,
                                    std::initializer_list<const char *> optionenMitWert, int anzahl,
                                    const char *erwartet);

// Loads pfad as the open command does (counters start at 0); false after the load message.
bool LadeDatei(const QString &pfad, InitMini &d, Meldungen &meldungen);
