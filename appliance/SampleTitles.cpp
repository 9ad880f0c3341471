#include "appliance/SampleTitles.h"

#include "appliance/SampleBackgrounds.h"
#include "document/TText.h"

#include <QString>
#include <memory>

namespace
{

constexpr const char* LATIN = "KST";
constexpr const char* CHINESE = "DFHeiW5-A";
constexpr const char* JAPANESE = "KST Japanese Pro";
constexpr const char* KOREAN = "YDGothic 100 Pro";

enum Shadow { NO_SHADOW = 0, RIGHT_DOWN = 1, CENTRE_DOWN = 2 };

// How one text object looks: sizes on the 1920 wide raster, place on the 1280 wide canvas.
struct Look {
    float x;
    float y;
    const char* family;
    int size;
    const char* color = "#FFFFFF";
    int bold = 0;
    int edgeWidth = 0; // 0 is no outline
    const char* edgeColor = "#000000";
    Shadow shadow = NO_SHADOW;
};

TextStyle styleOf(const Look& look)
{
    TextStyle style;
    style.setFontFamily(look.family);
    style.setAlphaDefaultFontOfInputLanguage(LATIN);
    style.setFontSize(look.size);
    style.setFontColor(look.color);
    style.setFontBold(look.bold);
    if (look.edgeWidth > 0) {
        TEdge edge;
        edge.setEdgeWidth(look.edgeWidth);
        edge.setEdgeColor(look.edgeColor);
        style.setTextEdge(edge);
        style.setIsTextEdge(1);
    }
    return style;
}

// Appends a text object with one run a character, as the canvas keeps them.
void addText(std::vector<TText*>& texts, const char* utf8, const Look& look)
{
    auto text = std::make_unique<TText>();
    const int id = static_cast<int>(texts.size()) + 1;
    text->setTextObjectID(id);
    text->setText(utf8);
    text->setXValue(look.x);
    text->setYValue(look.y);
    text->setZValue(static_cast<float>(id));
    text->setTextAlign(-1);
    text->setShadowStyle(look.shadow);
    if (look.shadow != NO_SHADOW) {
        TShadow shadow;
        shadow.setShadowDirectionX(look.shadow == RIGHT_DOWN ? 1 : 0);
        shadow.setShadowDirectionY(1);
        text->setTextShadow(shadow);
    }
    std::vector<TextStyle*> items;
    const QString characters = QString::fromUtf8(utf8);
    for (const QChar c : characters) {
        auto style = std::make_unique<TextStyle>(styleOf(look));
        style->setText(QString(c).toStdString());
        items.push_back(style.release());
    }
    text->setTextItems(items);
    texts.push_back(text.release());
}

using Lines = std::vector<std::pair<const char*, Look>>;

SampleTitles::Sample sample(const char* stem, QImage (*background)(), const Lines& lines)
{
    SampleTitles::Sample made{stem, background, Archive()};
    std::vector<TText*> texts;
    for (const auto& [text, look] : lines) {
        addText(texts, text, look);
    }
    made.archive.setText(texts);
    made.archive.setVersion("1.0");
    return made;
}

std::vector<SampleTitles::Sample> welcome()
{
    std::vector<SampleTitles::Sample> samples;
    samples.push_back(sample(
        "20240101090000001", SampleBackgrounds::cityNight,
        {{"Evening News", {.x = 20, .y = 546, .family = LATIN, .size = 96, .bold = 1, .edgeWidth = 3}},
         {"晚间新闻",
          {.x = 700, .y = 532, .family = CHINESE, .size = 96, .color = "#FFD24D", .shadow = RIGHT_DOWN}}}));
    samples.push_back(sample(
        "20240101090000002", SampleBackgrounds::stageLights,
        {{"Live", {.x = 60, .y = 20, .family = LATIN, .size = 87, .color = "#FFFFFF", .shadow = RIGHT_DOWN}},
         {"现场直播", {.x = 660, .y = 140, .family = CHINESE, .size = 99, .color = "#FFD24D"}},
         {"生放送",
          {.x = 60, .y = 300, .family = JAPANESE, .size = 111, .edgeWidth = 4, .edgeColor = "#7A1050"}},
         {"생방송",
          {.x = 700, .y = 440, .family = KOREAN, .size = 111, .color = "#8FE3FF", .shadow = CENTRE_DOWN}}}));
    samples.push_back(
        sample("20240101090000003", SampleBackgrounds::lowerThird,
               {{"Café Zürich", {.x = 20, .y = 530, .family = "Nimbus Roman No9 L", .size = 81}},
                {"10:30", {.x = 960, .y = 530, .family = "Nimbus Mono L", .size = 81, .color = "#FFD24D"}}}));
    samples.push_back(
        sample("20240101090000004", nullptr,
               {{"Good night",
                 {.x = 300, .y = 260, .family = LATIN, .size = 111, .edgeWidth = 4, .shadow = RIGHT_DOWN}}}));
    return samples;
}

std::vector<SampleTitles::Sample> weather()
{
    std::vector<SampleTitles::Sample> samples;
    samples.push_back(sample("20240101100000001", SampleBackgrounds::lowerThird,
                             {{"天气预报", {.x = 20, .y = 530, .family = CHINESE, .size = 96, .bold = 1}}}));
    samples.push_back(sample("20240101100000002", SampleBackgrounds::lowerThird,
                             {{"多云 21 °C", {.x = 20, .y = 530, .family = CHINESE, .size = 96}}}));
    return samples;
}

} // namespace

std::vector<SampleTitles::Folder> SampleTitles::folders()
{
    std::vector<Folder> made;
    made.push_back({"Welcome", welcome()});
    made.push_back({"天气", weather()});
    return made;
}

std::vector<SampleTitles::Sample> SampleTitles::templates(bool chinese)
{
    const char* family = chinese ? CHINESE : LATIN;
    std::vector<Sample> made;
    made.push_back(sample("Centre", SampleBackgrounds::empty,
                          {{chinese ? "标题" : "Title Goes Here",
                            {.x = chinese ? 500.0F : 260.0F, .y = 280, .family = family, .size = 96}}}));
    made.push_back(
        sample("LowerThird", SampleBackgrounds::lowerThird,
               {{chinese ? "标题" : "Title Goes Here", {.x = 20, .y = 530, .family = family, .size = 96}}}));
    made.push_back(sample("Stage", SampleBackgrounds::stageLights,
                          {{chinese ? "标题" : "Title Goes Here",
                            {.x = 60, .y = 60, .family = family, .size = 120, .bold = 1, .edgeWidth = 4}}}));
    return made;
}
