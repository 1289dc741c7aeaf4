// Builds the sample parish that ships as examples/beispiel.prd and writes it with the program's
// own writer, so the file always has the current format. Usage: pradilon-beispiel OUT

#include "data/DatenDatei.h"
#include "data/InitMini.h"

#include <QString>

#include <algorithm>
#include <cstdio>
#include <initializer_list>

namespace {

const QString Ort = QStringLiteral("87654 Sankt Aldern");

enum Wochentage : int { So = 1, Mo, Di, Mi, Do, Fr, Sa };

struct Angaben {
    const char *name;
    const char *vorname;
    const char *strasse;
    const char *telefon;
    std::initializer_list<int> ausgenommen;
    std::initializer_list<const char *> termine;
    bool oberministrant = false;
    bool nichtEinteilen = false;
};

Mini MacheMini(const Angaben &a)
{
    Mini m;
    m.Name = QString::fromUtf8(a.name);
    m.Vorname = QString::fromUtf8(a.vorname);
    m.Strasse = QString::fromUtf8(a.strasse);
    m.Telefon = QString::fromUtf8(a.telefon);
    m.Ort = Ort;
    for (int tag : a.ausgenommen)
        m.Ausgenommen[std::size_t(tag)] = true;
    for (const char *termin : a.termine)
        m.Termine[std::size_t(m.AnzahlTermine++)] = QString::fromUtf8(termin);
    m.Oberministrant = a.oberministrant;
    m.NichtEinteilen = a.nichtEinteilen;
    return m;
}

void Regulaer(InitMini &d, int tag, std::initializer_list<std::pair<const char *, const char *>> dienste)
{
    int k = 0;
    for (const auto &[zeit, anzahl] : dienste) {
        d.Regulaer[std::size_t(tag)].Zeit[std::size_t(k)] = QString::fromUtf8(zeit);
        d.Regulaer[std::size_t(tag)].MiniAnz[std::size_t(k)] = QString::fromUtf8(anzahl);
        ++k;
    }
}

void Feiertag(InitMini &d, const char *datum, std::initializer_list<std::pair<const char *, const char *>> dienste)
{
    AusnahmeSeite seite;
    seite.Datum = QString::fromUtf8(datum);
    int k = 0;
    for (const auto &[zeit, anzahl] : dienste) {
        seite.Zeit[std::size_t(k)] = QString::fromUtf8(zeit);
        seite.MiniAnz[std::size_t(k)] = QString::fromUtf8(anzahl);
        ++k;
    }
    d.Ausnahmen.push_back(seite);
}

InitMini Beispielgemeinde()
{
    InitMini d;
    const Angaben roster[] = {
        {"Aigner", "Lukas", "Bergstraße 21", "07345 2218", {}, {"06.02.2027-14.02.2027"}},
        {"Bäumler", "Jonas", "Lindenstraße 4", "07345 1093", {}, {"01.01.2027-06.01.2027"}},
        {"Bäumler", "Lea", "Lindenstraße 4", "07345 1093", {}, {"01.01.2027-06.01.2027", "17.04.2027"}},
        {"Brandstätter", "Hannah", "Obere Gärten 9", "07345 3871", {Mi}, {}},
        {"Dörfler", "Maximilian", "Kapellenweg 2", "07345 4410", {}, {"26.07.2027-13.08.2027"}, true},
        {"Eßer", "Clara", "Fliederweg 15", "07345 9027", {Sa}, {"20.03.2027"}},
        {"Fröhlich", "Noah", "Talstraße 33", "", {}, {}},
        {"Gänsler", "Emma", "Am Anger 6", "07345 7712", {Sa, Mi}, {}},
        {"Hülsmann", "Greta", "Kirchplatz 3", "07345 5546", {Sa}, {"24.12.2026"}},
        {"Hülsmann", "Tim", "Kirchplatz 3", "07345 5546", {}, {"24.12.2026"}},
        {"Jäger", "Ben", "Mühlgasse 1", "07345 6630", {Mi}, {"05.06.2027-19.06.2027"}},
        {"Kößler", "Mia", "Schulstraße 18", "07345 8125", {}, {"25.12.2026", "09.05.2027"}},
        {"Krämer", "Marie", "Schloßallee 7", "07345 2954", {}, {"12.03.2027-21.03.2027"}},
        {"Krämer", "Paul", "Schloßallee 7", "07345 2954", {}, {"12.03.2027-21.03.2027"}},
        {"Lämmle", "Elias", "Rosenstraße 11", "07345 3306", {So}, {}},
        {"Möhrle", "Lina", "Weiherstraße 5", "07345 4789", {}, {"02.08.2027-27.08.2027", "31.10.2027"}},
        {"Nüßlein", "Anton", "Gartenstraße 27", "07345 1168", {}, {}},
        {"Pöschl", "Ida", "Brunnenweg 8", "07345 6071", {Mi}, {"28.03.2027"}},
        {"Rübsam", "Leon", "Hauptstraße 40", "07345 5893", {}, {}, false, true},
        {"Schäfer", "Johanna", "Lerchenweg 13", "07345 2405", {}, {"01.05.2027-09.05.2027"}, true},
        {"Thürauf", "Moritz", "Wiesenstraße 2", "07345 9342", {Sa}, {}},
        {"Vögele", "Frieda", "Fuchsweg 19", "07345 7150", {}, {"23.12.2027-31.12.2027"}},
        {"Weißgerber", "Emil", "Am Mühlbach 12", "07345 8861", {}, {"14.02.2027"}},
        {"Weißgerber", "Felix", "Am Mühlbach 12", "07345 8861", {}, {"14.02.2027"}, true},
        {"Weißgerber", "Sophie", "Am Mühlbach 12", "07345 8861", {}, {"14.02.2027"}},
        {"Zöllner", "Jakob", "Höhenweg 24", "07345 3517", {Mi}, {"22.05.2027-30.05.2027"}},
    };
    for (const Angaben &a : roster)
        d.Minis.push_back(MacheMini(a));
    d.AnzahlMinis = int16_t(d.Minis.size());
    d.Minis.emplace_back();   // the spare top element the roster keeps
    d.Sperre.assign(d.Minis.size(), 0);
    d.Einsaetze.assign(d.Minis.size(), 0);

    Regulaer(d, So, {{"8.30", "4"}, {"10.00", "6"}, {"18.00", "2"}});
    Regulaer(d, Mi, {{"19.00", "2"}});
    Regulaer(d, Sa, {{"18.30", "4"}});

    Feiertag(d, "24.12.2026", {{"16.00", "4"}, {"22.00", "6"}});
    Feiertag(d, "25.12.2026", {{"10.00", "6"}, {"18.00", "2"}});
    Feiertag(d, "26.12.2026", {{"10.00", "4"}});
    Feiertag(d, "25.03.2027", {{"19.00", "6"}});
    Feiertag(d, "26.03.2027", {{"15.00", "4"}});
    Feiertag(d, "27.03.2027", {{"21.00", "8"}});
    Feiertag(d, "28.03.2027", {{"10.00", "8"}, {"18.00", "2"}});
    Feiertag(d, "29.03.2027", {{"10.00", "4"}});
    Feiertag(d, "06.05.2027", {{"10.00", "6"}});
    Feiertag(d, "24.12.2027", {{"16.00", "4"}, {"22.00", "6"}});
    Feiertag(d, "25.12.2027", {{"10.00", "6"}, {"18.00", "2"}});
    Feiertag(d, "26.12.2027", {{"10.00", "4"}});
    // The services page keeps its pages ordered by the date text, character by character.
    std::stable_sort(d.Ausnahmen.begin(), d.Ausnahmen.end(),
                     [](const AusnahmeSeite &a, const AusnahmeSeite &b) { return a.Datum < b.Datum; });
    d.AnzahlAusnahmen = int16_t(d.Ausnahmen.size());

    d.Intervall = 2;
    d.Geschwister = true;
    return d;
}

} // namespace

int main(int argc, char *argv[])
{
    if (argc != 2) {
        std::fputs("Aufruf: pradilon-beispiel OUT\n", stderr);
        return 64;
    }
    QString fehler;
    if (!SchreibeDatei(QString::fromLocal8Bit(argv[1]), Beispielgemeinde(), &fehler)) {
        std::fprintf(stderr, "pradilon-beispiel: %s\n", fehler.toUtf8().constData());
        return 5;
    }
    return 0;
}
