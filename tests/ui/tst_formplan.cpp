#include "ui/FormPlan.h"

#include "data/InitMini.h"
#include "output/TextExport.h"
#include "support_seiten.h"

#include <QImage>
#include <QListWidget>
#include <QPointer>
#include <QPushButton>
#include <QTest>

#include <memory>

namespace {

PlanEintrag eintrag(const QString &datum, const QString &tag, const QString &zeit, const QStringList &namen)
{
    PlanEintrag e;
    e.Datum = datum;
    e.Wochentag = tag;
    e.Zeit = zeit;
    e.MiniAnz = int16_t(namen.size());
    for (int j = 0; j < namen.size(); ++j) {
        e.Vorname[j] = namen[j].section(u' ', 0, 0);
        e.Name[j] = namen[j].section(u' ', 1);
    }
    return e;
}

void setzePlan(InitMini &d, const std::vector<PlanEintrag> &plan)
{
    d.Plan = plan;
    d.Plan.emplace_back();
    d.AnzahlPlanEintraege = int16_t(plan.size());
}

QStringList zeilen(const QListWidget *liste)
{
    QStringList l;
    for (int i = 0; i < liste->count(); ++i)
        l << liste->item(i)->text();
    return l;
}

// The x position of the leftmost dark pixel within the given rows of the image; -1 if none.
int ersteTinte(const QImage &bild, const QRect &zeile)
{
    for (int x = 0; x < bild.width(); ++x) {
        for (int y = zeile.top(); y <= zeile.bottom() && y < bild.height(); ++y) {
            if (qGray(bild.pixel(x, y)) < 128)
                return x;
        }
    }
    return -1;
}

} // namespace

class TestFormPlan : public QObject
{
    Q_OBJECT

private slots:
    void einEintragZweiMinis()
    {
        InitMini d;
        setzePlan(d, {eintrag("01.12.2002", "Sonntag", "9.30", {"Anna Müller", "Bert Meier"})});
        FormPlan plan(d);
        QCOMPARE(plan.windowTitle(), QStringLiteral("Plan (01.12.2002 - 01.12.2002)"));
        const QStringList erwartet{"Ministrantenplan vom 01.12.2002 bis 01.12.2002", "", "",
                                   "Sonntag, den 01.12.2002, 9.30 Uhr", "\t\tAnna Müller", "\t\tBert Meier"};
        QCOMPARE(zeilen(kind<QListWidget>(&plan, QStringLiteral("ListPlan"))), erwartet);
    }

    void mehrereEintraegeWieDieTextdatei()
    {
        InitMini d;
        PlanEintrag leer = eintrag("03.12.2002", "Dienstag", "", {"Carla Neu"});
        leer.MiniAnz = 2;
        setzePlan(d, {eintrag("01.12.2002", "Sonntag", "9.30", {"Anna Müller"}),
                      eintrag("01.12.2002", "Sonntag", "11.00", {}), leer});
        FormPlan plan(d);
        QCOMPARE(plan.windowTitle(), QStringLiteral("Plan (01.12.2002 - 03.12.2002)"));
        const QStringList liste = zeilen(kind<QListWidget>(&plan, QStringLiteral("ListPlan")));
        QCOMPARE(liste, PlanZeilen(d));
        QCOMPARE(liste.size(), 11);
        QCOMPARE(liste.at(7), QString());
        QCOMPARE(liste.at(8), QStringLiteral("Dienstag, den 03.12.2002,  Uhr"));
        // A position the generator left empty: two TABs and a blank.
        QCOMPARE(liste.last(), QStringLiteral("\t\t "));
    }

    void ohnePlanLeer()
    {
        InitMini d;
        FormPlan plan(d);
        QCOMPARE(plan.windowTitle(), QStringLiteral("Ministrantenplan"));
        QCOMPARE(kind<QListWidget>(&plan, QStringLiteral("ListPlan"))->count(), 0);
    }

    void okSchliesstUndHatDenFokus()
    {
        InitMini d;
        setzePlan(d, {eintrag("01.12.2002", "Sonntag", "9.30", {"Anna Müller"})});
        auto *plan = new FormPlan(d);
        plan->setAttribute(Qt::WA_DeleteOnClose);
        QPointer<FormPlan> beobachter(plan);
        plan->show();
        QVERIFY(QTest::qWaitForWindowExposed(plan));
        auto *ok = kind<QPushButton>(plan, QStringLiteral("BtnOK"));
        QCOMPARE(plan->focusWidget(), ok);
        klicke(ok);
        QTRY_VERIFY(beobachter.isNull());
    }

    void minisStehenEingerueckt()
    {
        InitMini d;
        setzePlan(d, {eintrag("01.12.2002", "Sonntag", "9.30", {"Anna Müller"})});
        FormPlan plan(d);
        plan.show();
        QVERIFY(QTest::qWaitForWindowExposed(&plan));
        auto *liste = kind<QListWidget>(&plan, QStringLiteral("ListPlan"));
        const QImage bild = liste->viewport()->grab().toImage();
        const int kopf = ersteTinte(bild, liste->visualItemRect(liste->item(3)));
        const int mini = ersteTinte(bild, liste->visualItemRect(liste->item(4)));
        QVERIFY(kopf >= 0);
        QVERIFY2(mini > kopf + 2 * liste->fontMetrics().averageCharWidth(),
                 qPrintable(QStringLiteral("%1 / %2").arg(kopf).arg(mini)));
    }
};

QTEST_MAIN(TestFormPlan)
#include "tst_formplan.moc"
