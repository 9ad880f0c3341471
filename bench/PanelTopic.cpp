// Showing what the 300 characters of a new selection have in common in the panel, until it is painted,
// compared with plain widgets that show the same values.
#include "bench/BenchTitles.h"
#include "bench/PairList.h"
#include "bench/Topics.h"
#include "document/TText.h"
#include "panel/SizeLadder.h"
#include "panel/TextToolsPanel.h"
#include "panel/TextToolsPanelController.h"

#include <QApplication>
#include <QComboBox>
#include <QHBoxLayout>
#include <QPushButton>

#include <array>
#include <memory>

// Outside the namespace, since the macro declares functions.
static void loadPictures()
{
    Q_INIT_RESOURCE(TitlerToolResource);
    Q_INIT_RESOURCE(UILibrary);
}

namespace
{

constexpr double AIM = 3.0;
constexpr double LIMIT = 2.0; // milliseconds
constexpr int CHARACTERS = 300;
const QSize PANEL(1363, 209);

using Selections = std::array<std::unique_ptr<TText>, 2>;

// Returns two selections that differ in every property; the characters within each differ, too.
Selections makeSelections()
{
    Selections selections;
    for (int which = 0; which < int(selections.size()); ++which) {
        auto text = BenchTitles::text(1, 10, 10,
                                      {.characters = CHARACTERS, .size = 48, .edgeWidth = 3, .shadow = true});
        int position = 0;
        for (TextStyle* style : text->textItems()) {
            const bool odd = ++position % 2 == 0;
            style->setFontSize((odd ? 40 : 64) + 8 * which);
            style->setFontBold(odd);
            style->setIsTextItalic(!odd);
            style->setFontFamily(which == 0 && odd ? "KST Japanese Pro" : "KST");
            style->setFontColor(which == 0 ? "#C80000" : "#2987F2");
            style->setTextKerning(which == 0 ? 80 : 110);
            style->setIsTextEdge(which);
            TEdge edge = style->getTextEdge();
            edge.setEdgeWidth(which == 0 ? 3 : 7);
            edge.setEdgeColor(which == 0 ? "#393939" : "#FFFDA8");
            style->setTextEdge(edge);
        }
        text->setTextAlign(which);
        text->setShadowStyle(1 + which);
        selections[std::size_t(which)] = std::move(text);
    }
    return selections;
}

// Carries out the layout, styling and painting that the change has queued.
void show()
{
    QCoreApplication::sendPostedEvents();
    QCoreApplication::processEvents();
}

void updatePanel(benchmark::State& state)
{
    loadPictures();
    const Selections selections = makeSelections();
    QWidget window;
    window.resize(PANEL);
    TextToolsPanel panel(&window);
    panel.setGeometry(QRect(QPoint(), PANEL));
    panel.selectionModeForShadowAndAlign(true, true);
    window.show();
    // The panel exists as long as the program, so its pictures are loaded before the measurement.
    for (const auto& selection : selections) {
        panel.updateTextStyle(selection.get());
        show();
    }
    std::size_t turn = 0;
    for ([[maybe_unused]] auto _ : state) {
        panel.updateTextStyle(selections[++turn % selections.size()].get());
        show();
    }
}

// Plain widgets for the same values: two drop-down lists, switches, a number and two colours by style sheet.
class PlainPanel : public QWidget
{
public:
    PlainPanel()
    {
        resize(PANEL);
        auto* row = new QHBoxLayout(this);
        m_family.addItems(TextToolsPanelController().getFontLib());
        m_size.setEditable(true);
        for (const int size : SizeLadder::comboBoxSizes())
            m_size.addItem(QString::number(size));
        row->addWidget(&m_family);
        row->addWidget(&m_size);
        row->addWidget(&m_width);
        for (QPushButton& button : m_switches) {
            button.setCheckable(true);
            row->addWidget(&button);
        }
        for (QPushButton& color : m_colors)
            row->addWidget(&color);
    }

    void update(const TText& text)
    {
        const auto& items = text.textItems();
        const TextStyle& first = *items.front();
        const TextStyle& last = *items.back();
        bool family = true;
        bool bold = true;
        bool italic = true;
        bool size = true;
        int smallest = first.getFontSize();
        for (const TextStyle* item : items) {
            family = family && item->getFontFamily() == first.getFontFamily();
            bold = bold && item->isFontBold() == first.isFontBold();
            italic = italic && item->isTextItalic() == first.isTextItalic();
            size = size && item->getFontSize() == first.getFontSize();
            smallest = std::min(smallest, item->getFontSize());
        }
        m_family.setCurrentIndex(family ? m_family.findText(QString::fromStdString(first.getFontFamily()))
                                        : -1);
        m_size.setEditText(QString::number(smallest) + (size ? "" : "+"));
        m_switches[0].setChecked(bold && first.isFontBold());
        m_switches[1].setChecked(italic && first.isTextItalic());
        check(2, 2, last.isTextEdge());
        check(4, 4, text.getShadowStyle());
        check(8, 3, text.getTextAlign() + 1);
        m_switches[11].setEnabled(last.getTextKerning() > 80);
        m_switches[12].setEnabled(last.getTextKerning() < 120);
        const TEdge& edge = last.textEdge();
        m_width.setText(QString::number(edge.getEdgeWidth()));
        paint(m_colors[0], last.getFontColor());
        paint(m_colors[1], edge.getEdgeColor());
    }

private:
    void check(std::size_t begin, int count, int chosen)
    {
        for (int i = 0; i < count; ++i)
            m_switches[begin + std::size_t(i)].setChecked(i == chosen);
    }
    static void paint(QPushButton& button, const std::string& color)
    {
        button.setStyleSheet(
            QStringLiteral("background-color:%1; border-radius:4px;").arg(QString::fromStdString(color)));
    }

    QComboBox m_family{this};
    QComboBox m_size{this};
    QPushButton m_width{this};
    std::array<QPushButton, 13> m_switches;
    std::array<QPushButton, 2> m_colors;
};

void updatePlainPanel(benchmark::State& state)
{
    const Selections selections = makeSelections();
    PlainPanel panel;
    panel.show();
    for (const auto& selection : selections) {
        panel.update(*selection);
        show();
    }
    std::size_t turn = 0;
    for ([[maybe_unused]] auto _ : state) {
        panel.update(*selections[++turn % selections.size()]);
        show();
    }
}

} // namespace

void Topics::addPanel(PairList& list)
{
    list.add({"panel_update", AIM, PairList::Clock::Cpu, LIMIT}, benchmark::kMicrosecond, updatePanel,
             updatePlainPanel);
}
