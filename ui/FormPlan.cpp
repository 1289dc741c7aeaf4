#include "ui/FormPlan.h"

#include "data/InitMini.h"
#include "output/TextExport.h"

#include <QListWidget>
#include <QPainter>
#include <QPushButton>
#include <QStyledItemDelegate>
#include <QTextOption>
#include <QVBoxLayout>

namespace {

// Draws the list lines with fixed tab stops, so the two TABs before each server indent it
// by the same width on every platform.
class TabZeilen : public QStyledItemDelegate
{
public:
    using QStyledItemDelegate::QStyledItemDelegate;

    void paint(QPainter *painter, const QStyleOptionViewItem &option, const QModelIndex &index) const override
    {
        QStyleOptionViewItem opt = option;
        initStyleOption(&opt, index);
        const QString text = opt.text;
        opt.text.clear();
        const QWidget *widget = opt.widget;
        QStyle *style = widget ? widget->style() : nullptr;
        if (style)
            style->drawControl(QStyle::CE_ItemViewItem, &opt, painter, widget);
        QTextOption textOption(Qt::AlignLeft | Qt::AlignVCenter);
        textOption.setWrapMode(QTextOption::NoWrap);
        textOption.setTabStopDistance(TabAbstand(opt.fontMetrics));
        painter->save();
        painter->setFont(opt.font);
        painter->setPen(opt.palette.color(opt.state & QStyle::State_Selected ? QPalette::HighlightedText
                                                                             : QPalette::Text));
        painter->drawText(QRectF(opt.rect.adjusted(3, 0, -3, 0)), text, textOption);
        painter->restore();
    }

    static qreal TabAbstand(const QFontMetrics &metrik) { return 2.0 * metrik.averageCharWidth(); }
};

} // namespace

FormPlan::FormPlan(const InitMini &daten, QWidget *parent)
    : QWidget(parent, Qt::Window)
{
    setObjectName(QStringLiteral("FormPlan"));
    setWindowTitle(QStringLiteral("Ministrantenplan"));

    auto *listPlan = new QListWidget(this);
    listPlan->setObjectName(QStringLiteral("ListPlan"));
    listPlan->setItemDelegate(new TabZeilen(listPlan));
    auto *btnOK = new QPushButton(QStringLiteral("OK"), this);
    btnOK->setObjectName(QStringLiteral("BtnOK"));
    btnOK->setMinimumWidth(121);
    connect(btnOK, &QPushButton::clicked, this, &QWidget::close);

    auto *layout = new QVBoxLayout(this);
    layout->setContentsMargins(8, 8, 8, 8);
    layout->addWidget(listPlan, 1);
    layout->addWidget(btnOK, 0, Qt::AlignHCenter);
    resize(sizeHint());

    const int n = daten.AnzahlPlanEintraege - 1;
    if (n >= 0) {
        setWindowTitle(QStringLiteral("Plan (") + daten.Plan[0].Datum + QStringLiteral(" - ") + daten.Plan[n].Datum
                       + u')');
        listPlan->addItems(PlanZeilen(daten));
    }
    btnOK->setFocus();
}

QSize FormPlan::sizeHint() const
{
    return QSize(306, 383);
}
