#include "support_umgebung.h"

#include "data/DatenDatei.h"
#include "ui/FormMinis.h"

#include <QAction>
#include <QFile>
#include <QMenu>
#include <QTest>

Testumgebung::Testumgebung()
{
    if (!ordner.isValid())
        qFatal("no temporary folder");
}

std::unique_ptr<FormMinis> NeuesHauptfenster(Testumgebung &t)
{
    auto f = std::make_unique<FormMinis>(t.umgebung());
    f->show();
    QApplication::setActiveWindow(f.get());
    if (!QTest::qWaitForWindowExposed(f.get()))
        qWarning("main window not exposed");
    return f;
}

InitMini Beispieldaten(const QStringList &namen, int plaene)
{
    InitMini d;
    d.AnzahlMinis = int16_t(namen.size());
    d.Minis.resize(namen.size() + 1);
    d.Sperre.assign(namen.size() + 1, 0);
    d.Einsaetze.assign(namen.size() + 1, 0);
    for (int i = 0; i < namen.size(); ++i) {
        d.Minis[i].Name = namen[i];
        d.Minis[i].Vorname = QStringLiteral("Vorname%1").arg(i);
    }
    d.AnzahlPlanEintraege = int16_t(plaene);
    d.Plan.resize(plaene + 1);
    for (int i = 0; i < plaene; ++i) {
        PlanEintrag &e = d.Plan[i];
        e.Datum = QStringLiteral("%1.01.2027").arg(i + 1, 2, 10, QLatin1Char('0'));
        e.Wochentag = QStringLiteral("Freitag");
        e.Zeit = QStringLiteral("9.30");
        e.MiniAnz = 1;
        e.Name[0] = namen.value(0);
        e.Vorname[0] = QStringLiteral("Vorname0");
    }
    return d;
}

void SchreibeBeispiel(const QString &pfad, const InitMini &daten)
{
    QString fehler;
    if (!SchreibeDatei(pfad, daten, &fehler))
        qFatal("cannot write %s: %s", qPrintable(pfad), qPrintable(fehler));
}

void Aufraeumen()
{
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    QCoreApplication::processEvents();
}

QAction *Aktion(FormMinis &f, const QString &name)
{
    auto *a = f.findChild<QAction *>(name);
    if (!a)
        qFatal("no menu item %s", qPrintable(name));
    return a;
}

bool MenueAn(FormMinis &f, const QString &menue)
{
    auto *m = f.findChild<QMenu *>(menue);
    if (!m)
        qFatal("no menu %s", qPrintable(menue));
    return m->menuAction()->isEnabled();
}

bool Erreichbar(FormMinis &f, const QString &aktion)
{
    QAction *a = Aktion(f, aktion);
    auto *menu = qobject_cast<QMenu *>(a->parent());
    return a->isEnabled() && (!menu || menu->menuAction()->isEnabled());
}

QString SichtbaresBild(FormMinis &f, const QString &knopf)
{
    QStringList sichtbar;
    for (const char *zustand : {"Up", "Down", "Dis"}) {
        auto *bild = f.findChild<QWidget *>(QStringLiteral("Im%1%2").arg(knopf, QLatin1String(zustand)));
        if (bild && bild->isVisibleTo(&f))
            sichtbar << QLatin1String(zustand);
    }
    return sichtbar.join(QLatin1Char('+'));
}

bool Waehle(FormMinis &f, const QString &aktion)
{
    if (!Erreichbar(f, aktion))
        return false;
    Aktion(f, aktion)->trigger();
    return true;
}

QStringList Dateizeilen(const QString &pfad)
{
    QFile datei(pfad);
    if (!datei.open(QIODevice::ReadOnly))
        return {};
    return QString::fromLatin1(datei.readAll()).split(QStringLiteral("\r\n"));
}
