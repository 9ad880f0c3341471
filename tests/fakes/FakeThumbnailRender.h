#pragma once

#include "canvas/IThumbnailRender.h"

// What a FakeThumbnailRender was asked for, and what it answers.
struct RenderLog {
    int fast = 0; // small pictures
    int slow = 0; // all pictures
    bool finished = true;
    IThumbnailRender* render = nullptr;
};

// Counts the pictures that are wanted, and makes none. The log must outlive it.
class FakeThumbnailRender : public IThumbnailRender
{
public:
    explicit FakeThumbnailRender(RenderLog& log) : m_log(log) { m_log.render = this; }

    void makeThumbnail(const Archive* archive, bool bigSize) override
    {
        if (archive)
            ++(bigSize ? m_log.slow : m_log.fast);
    }
    bool makePictureThreadIsFinished() override { return m_log.finished; }

private:
    RenderLog& m_log;
};
