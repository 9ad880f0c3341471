#include "bench/TitleEditor.h"

namespace
{

constexpr int UNDO_LIMIT = 25;

} // namespace

const QSize TitleEditor::CANVAS(1280, 720);

TitleEditor::TitleEditor(const QString& folder, std::unique_ptr<IThumbnailRender> render)
    : scene(std::move(render)), view(&scene)
{
    scene.setSceneRect(QRectF(QPointF(0, 0), CANVAS));
    view.setFrameShape(QFrame::NoFrame);
    view.setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    view.setVerticalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    view.resize(CANVAS);
    view.show();
    const ArchiveList& list = shown.list;
    QObject::connect(&list, &ArchiveList::signalUpdateCanvas, &scene, &CanvasScene::slotUpdateArchive);
    QObject::connect(&list, &ArchiveList::itemSetDefaultState, &scene, &CanvasScene::slotMakeSceneThumnail);
    QObject::connect(&list, &ArchiveList::signalStartPasteArchive, &scene,
                     &CanvasScene::createThumnailPicture);
    QObject::connect(&scene, &CanvasScene::signalSaveOk, &list, &ArchiveList::refreshBaseItem);
    undo.setUndoLimit(UNDO_LIMIT);
    for (const auto command : {&ArchiveList::focusCommandSignal, &ArchiveList::pasteCommandSignal})
        QObject::connect(&list, command, &undo, &QUndoStack::push);
    shown.open(folder);
    ShownList::show(view);
}

void TitleEditor::show()
{
    ShownList::show(shown.list);
    ShownList::show(view);
}
