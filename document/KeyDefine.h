#pragma once

// Names of the keyer parameters of a title.
namespace KeyDefine
{

// The root attributes of a title file that can be changed without rewriting the title.
enum TITLE_PROP_ID_t { TITLE_PROP_CLIP = 0, TITLE_PROP_GAIN = 1, TITLE_PROP_DENSITY = 2 };

} // namespace KeyDefine
