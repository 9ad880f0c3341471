#include "panel/RangeOfMoveText.h"

#include "canvas/TextObjectConstants.h"
#include "touchui/KSPushbutton.h"
#include "touchui/KSRadiobutton.h"
#include "touchui/NewLayout.h"

#include <QEvent>
#include <QFontMetrics>
#include <QGridLayout>
#include <QHBoxLayout>
#include <QLabel>
#include <QVBoxLayout>

const QString RangeOfMoveText::MOVEDIRECTION_UP_ICON_PATH = iconPath("Icon_MoveUp");
const QString RangeOfMoveText::MOVEDIRECTION_RIGHT_ICON_PATH = iconPath("Icon_MoveRight");
const QString RangeOfMoveText::MOVEDIRECTION_DOWN_ICON_PATH = iconPath("Icon_MoveDown");
const QString RangeOfMoveText::MOVEDIRECTION_LEFT_ICON_PATH = iconPath("Icon_MoveLeft");
const QString RangeOfMoveText::MOVEDIRECTION_UP_ICON_DISABLED_PATH = iconPath("Icon_MoveUp_Disabled");
const QString RangeOfMoveText::MOVEDIRECTION_RIGHT_ICON_DISABLED_PATH = iconPath("Icon_MoveRight_Disabled");
const QString RangeOfMoveText::MOVEDIRECTION_DOWN_ICON_DISABLED_PATH = iconPath("Icon_MoveDown_Disabled");
const QString RangeOfMoveText::MOVEDIRECTION_LEFT_ICON_DISABLED_PATH = iconPath("Icon_MoveLeft_Disabled");
const QString RangeOfMoveText::MOVELABEL_STYLE = QStringLiteral("font:20px; color:rgb(220, 220, 220);");
const QString RangeOfMoveText::MOVELABEL_DISABLED_STYLE = QStringLiteral("font:20px; color:rgb(40, 40, 40);");

namespace
{

constexpr int TWO_PIXELS = 2;
constexpr int TEN_PIXELS = 10;
constexpr int TWO_PIXELS_ID = 0;
constexpr int TEN_PIXELS_ID = 1;
const char RADIO_PICTURES[] = ":/RadioButton";
constexpr int ROW_SPACING = 24;
constexpr int LABEL_SPACING = 8;
constexpr int RANGE_WIDTH = 110;
constexpr int RANGE_LABEL_WIDTH = 62;
constexpr int SLACK = 2; // tolerance, since widths are rounded

} // namespace

RangeOfMoveText::RangeOfMoveText(QWidget* parent) : ToolBox(parent)
{
    const QString icons[] = {MOVEDIRECTION_UP_ICON_PATH, MOVEDIRECTION_RIGHT_ICON_PATH,
                             MOVEDIRECTION_DOWN_ICON_PATH, MOVEDIRECTION_LEFT_ICON_PATH};
    for (int id = UPBUTTON_INDEX; id <= LEFTBUTTON_INDEX; ++id) {
        m_buttons[id] = addButton(Whole, QSize(MOVEBUTTON_WIDTH, WIDGET_HEIGHT), icons[id]);
        m_buttons[id]->setButtonId(id);
        connect(m_buttons[id], &QAbstractButton::clicked, this, [this, id] { moveChanged(id); });
    }
    m_description =
        addLabel(QSize(DESCRIPTIONLABEL_WIDTH, WIDGET_HEIGHT), MOVELABEL_STYLE, MOVELABEL_DISABLED_STYLE);
    m_description->setWordWrap(true);
    m_description->installEventFilter(this);
    m_twoPixels = addRangeChoice(TWO_PIXELS_ID);
    m_tenPixels = addRangeChoice(TEN_PIXELS_ID);
    m_twoPixels.button->setChecked(true);

    createLayout();
    translateText();
}

RangeOfMoveText::RangeChoice RangeOfMoveText::addRangeChoice(int id)
{
    RangeChoice choice;
    choice.button = new KSRadiobutton(this);
    choice.button->setImagesPath(QString::fromLatin1(RADIO_PICTURES));
    choice.button->setFixedSize(RADIOBUTTON_WIDTH, RADIOBUTTON_HEIGHT);
    choice.button->setFocusPolicy(Qt::NoFocus);
    choice.button->setObjectName(QStringLiteral("MoveRange%1").arg(id));
    choice.label =
        addLabel(QSize(RANGE_LABEL_WIDTH, WIDGET_HEIGHT), MOVELABEL_STYLE, MOVELABEL_DISABLED_STYLE);
    connect(choice.button, &QAbstractButton::clicked, this, [this, id] { rangeReleased(id); });
    return choice;
}

// Places the description above the left arm of the cross and the choices below it.
void RangeOfMoveText::createLayout()
{
    auto* grid = newLayout<QGridLayout>();
    grid->setColumnMinimumWidth(0, RANGE_WIDTH);
    grid->addLayout(createCross(), 0, 1, 5, 1);
    grid->addWidget(m_description, 0, 0, 1, 2, Qt::AlignLeft);
    int row = 1;
    for (const RangeChoice& choice : {m_twoPixels, m_tenPixels}) {
        auto* line = newLayout<QHBoxLayout>();
        line->addWidget(choice.button);
        line->addSpacing(LABEL_SPACING);
        line->addWidget(choice.label);
        line->addStretch();
        grid->setRowMinimumHeight(row++, ROW_SPACING);
        grid->addLayout(line, row++, 0);
    }
    setLayout(grid);
}

QLayout* RangeOfMoveText::createCross()
{
    auto* middle = newLayout<QVBoxLayout>();
    middle->addWidget(m_buttons[UPBUTTON_INDEX]);
    middle->addSpacing(SPACING_BETWEEN_UPBUTTON_AND_DOWNBUTTON);
    middle->addWidget(m_buttons[DOWNBUTTON_INDEX]);

    auto* cross = newLayout<QHBoxLayout>();
    cross->addWidget(m_buttons[LEFTBUTTON_INDEX], 0, Qt::AlignVCenter);
    cross->addSpacing(SPACING_BETWEEN_LEFTBUTTON_AND_UPBUTTON);
    cross->addLayout(middle);
    cross->addSpacing(SPACING_BETWEEN_UPBUTTON_AND_RIGHTBUTTON);
    cross->addWidget(m_buttons[RIGHTBUTTON_INDEX], 0, Qt::AlignVCenter);

    auto* column = newLayout<QVBoxLayout>();
    column->addStretch();
    column->addLayout(cross);
    column->addStretch();
    return column;
}

void RangeOfMoveText::moveChanged(int buttonId)
{
    Q_EMIT signalClearSizeBoxLineEditFocus(true);
    Q_EMIT moveRangeChanged(m_range, buttonId, TextObjectConstants::PropertyPosition);
}

void RangeOfMoveText::rangeReleased(int buttonId)
{
    Q_EMIT signalClearSizeBoxLineEditFocus(true);
    m_range = buttonId == TEN_PIXELS_ID ? TEN_PIXELS : TWO_PIXELS;
}

void RangeOfMoveText::setWidgetEnabled()
{
    ToolBox::setWidgetEnabled();
    m_twoPixels.button->setEnabled(true);
    m_tenPixels.button->setEnabled(true);
}

void RangeOfMoveText::setWidgetDisabled()
{
    ToolBox::setWidgetDisabled();
    m_twoPixels.button->setEnabled(false);
    m_tenPixels.button->setEnabled(false);
}

void RangeOfMoveText::resetInitializeStyle()
{
    m_range = TWO_PIXELS;
    m_twoPixels.button->setChecked(true);
    ToolBox::resetInitializeStyle();
}

bool RangeOfMoveText::eventFilter(QObject* watched, QEvent* event)
{
    if (watched == m_description && event->type() == QEvent::FontChange)
        balanceDescription();
    return ToolBox::eventFilter(watched, event);
}

// Narrows the description as far as its number of lines allows, so that the lines are about equally long.
void RangeOfMoveText::balanceDescription()
{
    m_description->setContentsMargins(0, 0, 0, 0);
    const QFontMetrics metrics(m_description->font());
    const auto area = [&](int width) {
        return metrics.boundingRect(QRect(0, 0, width, WIDGET_HEIGHT), Qt::TextWordWrap,
                                    m_description->text());
    };
    const int height = area(DESCRIPTIONLABEL_WIDTH).height();
    // Bisects, since measuring is slow: a text that fits into a width fits into all larger ones.
    int tooNarrow = -1;
    int width = DESCRIPTIONLABEL_WIDTH;
    while (width - tooNarrow > 1) {
        const int middle = (tooNarrow + width) / 2;
        const QRect lines = area(middle);
        if (lines.height() == height && lines.width() <= middle)
            width = middle;
        else
            tooNarrow = middle;
    }
    m_description->setContentsMargins(0, 0, qMax(0, DESCRIPTIONLABEL_WIDTH - width - SLACK), 0);
}

void RangeOfMoveText::translateText()
{
    m_description->setText(tr("Range of move per 1 tap"));
    balanceDescription();
    m_twoPixels.label->setText(tr("2px"));
    m_tenPixels.label->setText(tr("10px"));
}
