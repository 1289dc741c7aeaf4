#include "support_umgebung.h"

#include <QMenu>
#include <QMenuBar>

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
    const int n = int(namen.size());
    d.AnzahlMinis = int16_t(n);
    d.AnzahlPlanEintraege = int16_t(plaene);
    d.Minis.resize(n + 1);
    d.Sperre = d.Einsaetze = std::vector<int16_t>(n + 1, 0);
    for (int i = 0; i < n; ++i)
        d.Minis[i].Name = namen[i], d.Minis[i].Vorname = QStringLiteral("Vorname%1").arg(i);
    d.Plan.resize(plaene + 1);
    for (int i = 0; i < plaene; ++i)
        d.Plan[i] = PlanEintrag{QStringLiteral("%1.01.2027").arg(i + 1, 2, 10, QLatin1Char('0')), "Freitag", "9.30",
                                1, {namen.value(0)}, {"Vorname0"}};
    return d;
}

void SchreibeBeispiel(const QString &pfad, const InitMini &daten)
{
    if (!SchreibeDatei(pfad, daten))
        qFatal("cannot write %s", qPrintable(pfad));
}

void Aufraeumen()
{
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    QCoreApplication::processEvents();
}

QString SichtbaresBild(FormMinis &f, const QString &knopf)
{
    QStringList sichtbar;
    for (const QString zustand : {"Up", "Down", "Dis"})
        if (auto *bild = f.findChild<QWidget *>("Im" + knopf + zustand); bild && bild->isVisibleTo(&f))
            sichtbar << zustand;
    return sichtbar.join('+');
}

bool Waehle(FormMinis &f, const QString &aktion)
{
    auto *a = f.findChild<QAction *>(aktion);
    if (!a)
        qFatal("no menu item %s", qPrintable(aktion));
    const bool erreichbar = a->isEnabled() && qobject_cast<QMenu *>(a->parent())->menuAction()->isEnabled();
    if (erreichbar)
        a->trigger();
    return erreichbar;
}

QString Zustand(FormMinis &f)
{
    QStringList teile;
    for (QAction *menue : f.menuBar()->actions())
        for (QAction *a : menue->menu()->actions())
            if (!a->isSeparator() && !(a->isEnabled() && menue->isEnabled()))
                teile << a->objectName().mid(3);
    teile << "|";
    for (const char *knopf : {"Open", "Save", "Print", "Search", "New", "Help"})
        teile << SichtbaresBild(f, knopf);
    return teile.join(' ');
}
