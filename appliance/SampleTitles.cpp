#include "appliance/SampleTitles.h"

#include "appliance/SampleBackgrounds.h"
#include "document/TText.h"

#include <utility>

namespace
{

constexpr const char* LATIN = "KST";
constexpr const char* CHINESE = "DFHeiW5-A";
constexpr const char* JAPANESE = "KST Japanese Pro";
constexpr const char* KOREAN = "YDGothic 100 Pro";

// Returns a function that paints the picture at its full size and scales it to any other.
std::function<QImage(const QSize&)> scaled(QImage (*paint)())
{
    return [paint](const QSize& size) {
        const QImage picture = paint();
        return picture.size() == size ? picture
                                      : picture.scaled(size, Qt::IgnoreAspectRatio, Qt::SmoothTransformation);
    };
}

std::vector<SampleTitles::Sample> welcome()
{
    std::vector<SampleTitles::Sample> samples;
    samples.push_back(SampleTitles::sample(
        "20240101090000001", scaled(SampleBackgrounds::cityNight),
        {{"Evening News", {.x = 20, .y = 546, .family = LATIN, .size = 96, .bold = 1, .edgeWidth = 3}},
         {"晚间新闻",
          {.x = 700,
           .y = 532,
           .family = CHINESE,
           .size = 96,
           .color = "#FFD24D",
           .shadow = SampleText::RIGHT_DOWN}}}));
    samples.push_back(SampleTitles::sample(
        "20240101090000002", scaled(SampleBackgrounds::stageLights),
        {{"Live",
          {.x = 60,
           .y = 20,
           .family = LATIN,
           .size = 87,
           .color = "#FFFFFF",
           .shadow = SampleText::RIGHT_DOWN}},
         {"现场直播", {.x = 660, .y = 140, .family = CHINESE, .size = 99, .color = "#FFD24D"}},
         {"生放送",
          {.x = 60, .y = 300, .family = JAPANESE, .size = 111, .edgeWidth = 4, .edgeColor = "#7A1050"}},
         {"생방송",
          {.x = 700,
           .y = 440,
           .family = KOREAN,
           .size = 111,
           .color = "#8FE3FF",
           .shadow = SampleText::CENTRE_DOWN}}}));
    samples.push_back(SampleTitles::sample(
        "20240101090000003", scaled(SampleBackgrounds::lowerThird),
        {{"Café Zürich", {.x = 20, .y = 530, .family = "Nimbus Roman No9 L", .size = 81}},
         {"10:30", {.x = 960, .y = 530, .family = "Nimbus Mono L", .size = 81, .color = "#FFD24D"}}}));
    samples.push_back(SampleTitles::sample("20240101090000004", nullptr,
                                           {{"Good night",
                                             {.x = 300,
                                              .y = 260,
                                              .family = LATIN,
                                              .size = 111,
                                              .edgeWidth = 4,
                                              .shadow = SampleText::RIGHT_DOWN}}}));
    return samples;
}

std::vector<SampleTitles::Sample> weather()
{
    std::vector<SampleTitles::Sample> samples;
    samples.push_back(
        SampleTitles::sample("20240101100000001", scaled(SampleBackgrounds::lowerThird),
                             {{"天气预报", {.x = 20, .y = 530, .family = CHINESE, .size = 96, .bold = 1}}}));
    samples.push_back(
        SampleTitles::sample("20240101100000002", scaled(SampleBackgrounds::lowerThird),
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

SampleTitles::Sample SampleTitles::sample(const char* stem, std::function<QImage(const QSize&)> background,
                                          const std::vector<Line>& lines)
{
    Sample made{stem, std::move(background), Archive()};
    std::vector<TText*> texts; // owned by the record after setText
    for (const Line& line : lines)
        texts.push_back(SampleText::make(static_cast<int>(texts.size()) + 1, line.text, line.look).release());
    made.archive.setText(std::move(texts));
    made.archive.setVersion("1.0");
    return made;
}
