// Defaults and fixed strings of the title records and their files. Each translation unit has its own copy of
// the strings, so that they are initialised before any static object of that unit uses them.
#pragma once

#include <string>

static const std::string STR_EMPTY;
static const std::string STR_SLASH = "/";
static const std::string XML_VERSION = "1.0";
static const std::string XML_ENCODING = "utf-8";
static const std::string DEFAULT_TEXT = "Title Goes Here";
static const std::string DEFAULT_CLIP = "0";
static const std::string DEFAULT_GAIN = "0";
static const std::string DEFAULT_DENSITY = "100";
static const std::string DEFAULT_FONT_FAMILY = "KST";
static const std::string DEFAULT_FONT_CORLOR = "#FFFFFF";
static const std::string DEFAULT_SHADOW_COLOR = "#123123";
static const std::string DEFAULT_EDGE_COLOR = "#000000";
static const std::string TEMPLATE_RES_EN = "/templates_en";
static const std::string TEMPLATE_RES_CHS = "/templates_chs";
