#include "ui/FormPlan.h"

#include "data/InitMini.h"

FormPlan::FormPlan(const InitMini &daten, QWidget *parent)
    : QWidget(parent)
{
    (void)daten;
    setObjectName(QStringLiteral("FormPlan"));
}
