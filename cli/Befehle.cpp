#include "cli/Befehle.h"

#include "data/DatenDatei.h"
#include "data/InitMini.h"

#include <cstdio>

const std::vector<Befehl> &AlleBefehle()
{
    static const std::vector<Befehl> befehle = {
        {"info", "info FILE",
         "Zeigt Zahl der Minis, Ausnahmen und Planeinträge, das Intervall und ob Geschwister\n"
         "zusammen eingeteilt werden.",
         InfoBefehl},
        {"save", "save FILE OUT", "Lädt FILE und schreibt es nach OUT (immer, wie \"Speichern unter\").",
         SaveBefehl},
        {"plan", "plan FILE START END [--seed N] [-o OUT]",
         "Berechnet den Plan von START bis END (TT.MM.JJJJ) und speichert die Datei nach OUT\n"
         "(ohne -o: FILE selbst). Die Frage nach mehr als 100 Tagen wird mit Ja beantwortet.\n"
         "--seed N ersetzt den Startwert aus der Uhrzeit: gleiche Datei, Daten und N ergeben\n"
         "den gleichen Plan. Bei abgelehntem Zeitraum oder Rechenfehler wird nichts geschrieben.",
         PlanBefehl},
        {"plan-text", "plan-text FILE [-o PATH]",
         "Schreibt den Plan als PLAN.TXT neben FILE (oder nach PATH). Ohne Plan wird nichts\n"
         "geschrieben (Rückgabe 4).",
         PlanTextBefehl},
        {"addresses-text", "addresses-text FILE [-o PATH]",
         "Schreibt die Adressliste als ADRESS.TXT neben FILE (oder nach PATH).", AdressenTextBefehl},
        {"print", "print FILE --pdf OUT [--font NAME] [--size N] [--spacing S] [--no-addresses] [--no-plan]",
         "Druckt Adressliste und Plan wie \"Drucken ...\" als A4-PDF nach OUT. Voreinstellungen: die\n"
         "erste Schriftart, Größe 12, Zeilenabstand 1, beide Dokumente. Kann OUT nicht geschrieben\n"
         "werden, bleibt eine alte Datei unverändert (Rückgabe 5).",
         DruckBefehl},
    };
    return befehle;
}

Antwort CliMeldungen::zeige(const QString &text, Knoepfe knoepfe, Symbol, const QString &titel)
{
    SchreibeFehler(titel + QStringLiteral(": ") + text + u'\n');
    return (knoepfe == Knoepfe::OK || knoepfe == Knoepfe::OKAbbrechen) ? Antwort::OK : Antwort::Ja;
}

Argumente::Argumente(const QStringList &roh, std::initializer_list<const char *> optionenMitWert)
{
    for (qsizetype i = 0; i < roh.size(); ++i) {
        const QString &arg = roh[i];
        if (arg.size() < 2 || !arg.startsWith(u'-')) {
            m_positionen << arg;
            continue;
        }
        bool bekannt = false;
        for (const char *name : optionenMitWert)
            bekannt = bekannt || arg == QLatin1String(name);
        if (!bekannt) {
            m_fehler = QStringLiteral("unbekannte Option ") + arg;
            return;
        }
        if (i + 1 >= roh.size()) {
            m_fehler = QStringLiteral("Option ") + arg + QStringLiteral(" braucht einen Wert");
            return;
        }
        m_optionen.insert(arg, roh[++i]);
    }
}

std::optional<QString> Argumente::option(const char *name) const
{
    const auto it = m_optionen.constFind(QLatin1String(name));
    if (it == m_optionen.cend())
        return std::nullopt;
    return *it;
}

void SchreibeAus(const QString &text)
{
    const QByteArray bytes = text.toUtf8();
    std::fwrite(bytes.constData(), 1, std::size_t(bytes.size()), stdout);
    std::fflush(stdout);
}

void SchreibeFehler(const QString &text)
{
    const QByteArray bytes = text.toUtf8();
    std::fwrite(bytes.constData(), 1, std::size_t(bytes.size()), stderr);
    std::fflush(stderr);
}

int Verwendungsfehler(const char *befehl, const QString &grund)
{
    QString text = QStringLiteral("pradilon-cli: ") + grund + u'\n';
    for (const Befehl &b : AlleBefehle()) {
        if (qstrcmp(b.name, befehl) == 0)
            text += QStringLiteral("Aufruf: pradilon-cli ") + QString::fromUtf8(b.aufruf) + u'\n';
    }
    SchreibeFehler(text);
    return FalscherAufruf;
}

std::optional<Argumente> LeseAufruf(const char *befehl, const QStringList &roh,
                                    std::initializer_list<const char *> optionenMitWert, int anzahl,
                                    const char *erwartet)
{
    Argumente a(roh, optionenMitWert);
    if (!a.gueltig()) {
        Verwendungsfehler(befehl, a.fehler());
        return std::nullopt;
    }
    if (a.positionen().size() != anzahl) {
        Verwendungsfehler(befehl, QString::fromUtf8(befehl) + QStringLiteral(" erwartet ") + QString::fromUtf8(erwartet));
        return std::nullopt;
    }
    return a;
}

bool LadeDatei(const QString &pfad, InitMini &d, Meldungen &meldungen)
{
    d.AlterDateiname = d.Dateiname;
    d.Dateiname = pfad;
    d.Geaendert = false;
    return Laden(d, meldungen);
}
