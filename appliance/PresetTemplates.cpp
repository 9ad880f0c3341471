#include "appliance/PresetTemplates.h"

#include "appliance/PresetBackgrounds.h"

namespace
{

using Look = SampleText::Look;

constexpr const char* WHITE = "#FFFFFF";
constexpr const char* PALE = "#D2E9F7";
constexpr const char* AMBER = "#FFB81C";
constexpr const char* NAVY = "#0B2159";
constexpr const char* BLACK = "#000000";

// The texts of a design in both languages, their look, and their position on the 1920 wide raster: x is the
// left edge, middle or right edge, by the alignment; y is the middle of the capitals of the first line.
struct Words {
    const char* english;
    const char* chinese;
    Look look;
    double x;
    double y;
    int chineseSize = 0; // font size for ideographs, which are taller; 0 for the same as in look
};

struct Design {
    const char* name;
    QImage (*background)(const QSize&); // null if there is none
    std::vector<Words> words;
};

const std::vector<Design>& designs()
{
    static const std::vector<Design> all{
        {"LowerThird",
         PresetBackgrounds::lowerThird,
         {{"LOCAL NEWS", "本地新闻", {.size = 44, .color = AMBER, .bold = 1, .kerning = 110}, 204, 816},
          {"New bridge opens on Saturday",
           "新大桥周六通车",
           {.size = 80, .color = WHITE, .bold = 1},
           204,
           903}}},
        {"NamePlate",
         PresetBackgrounds::namePlate,
         {{"Maria Keller", "陈美玲", {.size = 72, .color = NAVY, .bold = 1}, 228, 813},
          {"Architect", "建筑师", {.size = 44, .color = PALE}, 228, 907}}},
        {"Strap",
         PresetBackgrounds::strap,
         {{"BREAKING", "突发新闻", {.size = 54, .color = WHITE, .bold = 1}, 195, 920},
          {"Ferry service resumes this evening",
           "轮渡今晚恢复通航",
           {.size = 60, .color = WHITE},
           615,
           920}}},
        {"FullScreen",
         PresetBackgrounds::fullScreen,
         {{"TONIGHT AT NINE", "今晚九点", {.size = 54, .color = AMBER, .bold = 1, .kerning = 110}, 195, 306},
          {"The World\nin Motion",
           "世界\n在前行",
           {.size = 138, .color = WHITE, .bold = 1, .shadow = SampleText::RIGHT_DOWN},
           195,
           420,
           115},
          {"A film in four parts", "四集纪录片", {.size = 60, .color = PALE}, 195, 792}}},
        {"Quote",
         PresetBackgrounds::quote,
         {{"A city is made of\nthe people who walk\nthrough it.",
           "城市是由走过它的人们\n造就的。",
           {.size = 80, .color = WHITE, .italic = 1},
           678,
           363},
          {"Maria Keller", "陈美玲", {.size = 54, .color = AMBER, .bold = 1}, 678, 747}}},
        {"CornerMark",
         PresetBackgrounds::cornerMark,
         {{"LIVE", "直播", {.size = 44, .color = WHITE, .bold = 1}, 1332, 147},
          {"Geneva", "北京", {.size = 44, .color = WHITE, .align = SampleText::CENTRE}, 1593, 147}}},
        {"SidePanel",
         PresetBackgrounds::sidePanel,
         {{"At a glance", "内容提要", {.size = 80, .color = WHITE, .bold = 1}, 1173, 294},
          {"Opening hours", "开放时间", {.size = 54, .color = PALE}, 1227, 480},
          {"Tickets and prices", "票务信息", {.size = 54, .color = PALE}, 1227, 600},
          {"How to get there", "交通指南", {.size = 54, .color = PALE}, 1227, 720}}},
        {"Title",
         nullptr,
         {{"Title Goes Here",
           "标题文字",
           {.size = 138,
            .color = WHITE,
            .bold = 1,
            .edgeWidth = 3,
            .edgeColor = BLACK,
            .shadow = SampleText::RIGHT_DOWN,
            .align = SampleText::CENTRE},
           960,
           504},
          {"Subtitle",
           "副标题",
           {.size = 72,
            .color = WHITE,
            .edgeWidth = 2,
            .edgeColor = BLACK,
            .shadow = SampleText::CENTRE_DOWN,
            .align = SampleText::CENTRE},
           960,
           648}}},
    };
    return all;
}

} // namespace

std::vector<SampleTitles::Sample> PresetTemplates::samples(bool chinese)
{
    std::vector<SampleTitles::Sample> made;
    for (const Design& design : designs()) {
        std::vector<SampleTitles::Line> lines;
        for (const Words& words : design.words) {
            Look look = words.look;
            look.family = chinese ? "DFHeiW5-A" : "KST";
            if (chinese && words.chineseSize > 0)
                look.size = words.chineseSize;
            look.italic = chinese ? 0 : look.italic; // no italics for ideographs
            const char* text = chinese ? words.chinese : words.english;
            lines.push_back({text, SampleText::placed(look, text, words.x, words.y)});
        }
        made.push_back(SampleTitles::sample(design.name, design.background, lines));
    }
    return made;
}
