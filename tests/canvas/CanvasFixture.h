// A canvas with everything it needs, for tests: view, undo stack, messages, pictures.
#pragma once

#include "CanvasTestTools.h"
#include "tests/support/Patience.h"

#include "canvas/CanvasScene.h"
#include "canvas/CaretGeometry.h"
#include "canvas/GraphicsPixmap.h"
#include "canvas/GraphicsView.h"
#include "canvas/IInputLanguageSource.h"
#include "document/Archive.h"
#include "document/TitleParser.h"
#include "tests/fakes/FakeCanvasHost.h"
#include "tests/fakes/FakeMessageBoxController.h"
#include "tests/fakes/FakeThumbnailRender.h"
#include "touchui/KSSoftKeyboardCursorSettingEvent.h"

#include <QAction>
#include <QFileInfo>
#include <QGraphicsRectItem>
#include <QPen>
#include <QSignalSpy>
#include <QTemporaryDir>
#include <QTest>
#include <QTextBlock>
#include <QTextLayout>
#include <QUndoStack>
#include <cmath>

inline FakeMessageBoxController* messages = nullptr;

// A canvas with its view and an undo stack, as in the window.
class Canvas
{
public:
    Canvas()
        : scene(std::make_unique<CanvasScene>(std::make_unique<FakeThumbnailRender>(log))), view(scene.get())
    {
        scene->setSceneRect(TextObjectConstants::SCENE_RECT);
        view.setFrameStyle(0);
        view.setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
        view.setVerticalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
        view.resize(1280, 720);
        QObject::connect(scene.get(), &CanvasScene::signalPushUndoCommandIntoStack, &stack,
                         [this](QUndoCommand* command) { stack.push(command); });
        title.setPath((folder.path() + "/title.xml").toStdString());
    }
    void show()
    {
        view.show();
        QVERIFY(QTest::qWaitForWindowActive(&view, PATIENCE_MS));
    }
    void open(const QList<TText>& texts)
    {
        title.releaseVectorText();
        std::vector<TText*> records;
        for (const TText& text : texts)
            records.push_back(new TText(text));
        title.setText(records);
        scene->slotUpdateArchive(&title);
    }
    GraphicsText* text(int id) const { return scene->findTextItem(id); }
    // Returns a point on the first character of the object, in view coordinates.
    QPoint pointOn(int id) const
    {
        const GraphicsText* item = text(id);
        return view.mapFromScene(item->scenePos() + item->layoutRect().center());
    }
    void tap(QPoint point) { QTest::mouseClick(view.viewport(), Qt::LeftButton, {}, point); }
    void drag(QPoint from, QPoint to)
    {
        QTest::mousePress(view.viewport(), Qt::LeftButton, {}, from);
        QTest::mouseMove(view.viewport(), from + (to - from) / 2);
        sendMove(from + (to - from) / 2);
        sendMove(to);
        QTest::mouseRelease(view.viewport(), Qt::LeftButton, {}, to);
    }
    void sendMove(QPoint point)
    {
        QMouseEvent move(QEvent::MouseMove, point, view.viewport()->mapToGlobal(point), Qt::NoButton,
                         Qt::LeftButton, {});
        QCoreApplication::sendEvent(view.viewport(), &move);
    }
    // Returns the title as it is saved in the file.
    std::unique_ptr<Archive> saved() const
    {
        auto archive = std::make_unique<Archive>();
        return TitleParser().readOneTitle(title.getPath(), archive.get()) == 1 ? std::move(archive) : nullptr;
    }

    QTemporaryDir folder;
    Archive title;
    RenderLog log;
    QUndoStack stack;
    std::unique_ptr<CanvasScene> scene;
    GraphicsView view;
};

inline const QPoint EmptyPlace(1200, 680);
