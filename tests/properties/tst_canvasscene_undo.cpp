#include "RandomEditor.h"
#include "tests/support/RandomSeed.h"

#include <QElapsedTimer>
#include <QFile>
#include <QPainter>
#include <deque>
#include <map>
#include <set>

// Undo and redo of whatever is done in whatever order. TITLER_SEED repeats a run, TITLER_EDITS changes its
// length.
class tst_canvasscene_undo : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();
    void init();
    void cleanup();
    void undoAllRedoAll();
    void shortHistory();
    void focusCommandsOnACleanStack();

private:
    int m_edits = 0;
};

namespace
{

#ifdef __SANITIZE_ADDRESS__
constexpr int DEFAULT_EDITS = 1000;
#else
constexpr int DEFAULT_EDITS = 10000;
#endif
constexpr int DEFAULT_SEED = 20231;
// The undo limit of the window.
constexpr int WINDOW_UNDO_LIMIT = 25;
constexpr int FOCUS_COMMAND_ID = 1;

// What the window pushes when another title is selected.
class FocusCommand : public QUndoCommand
{
public:
    int id() const override { return FOCUS_COMMAND_ID; }
};

// The objects shown, by their ids: one that undo has brought back stands last in the list of texts and in the
// file, wherever it stood before.
QList<GraphicsText*> textsById(const Canvas& canvas)
{
    QList<GraphicsText*> texts = canvas.scene->getTextItemList();
    std::sort(texts.begin(), texts.end(), [](const GraphicsText* a, const GraphicsText* b) {
        return a->getItemTText()->getTextObjectID() < b->getItemTText()->getTextObjectID();
    });
    return texts;
}

// The bytes of the title on disk, its texts sorted.
QString fileOf(const Canvas& canvas)
{
    QFile file(QString::fromStdString(canvas.title.getPath()));
    if (!file.open(QIODevice::ReadOnly))
        return {};
    const QString xml = QString::fromUtf8(file.readAll());
    static const QLatin1String opening("<content ");
    const qsizetype end = xml.indexOf(QLatin1String("</meta-text>"));
    const qsizetype begin = xml.indexOf(opening);
    if (begin < 0)
        return xml;
    QStringList texts = xml.mid(begin, end - begin).trimmed().split(opening, Qt::SkipEmptyParts);
    for (QString& text : texts)
        text = text.trimmed();
    texts.sort();
    return xml.left(begin) + opening + texts.join(opening) + xml.mid(end);
}

// Returns the first lines that differ, with their numbers; empty if there are none.
QString difference(const QString& now, const QString& then)
{
    const QStringList a = now.split(QLatin1Char('\n'));
    const QStringList b = then.split(QLatin1Char('\n'));
    for (qsizetype i = 0; i < qMax(a.size(), b.size()); ++i) {
        if (a.value(i) != b.value(i) || (i < a.size()) != (i < b.size()))
            return QString("line %1 of %2, should be %3: '%4', should be '%5'")
                .arg(i)
                .arg(a.size())
                .arg(b.size())
                .arg(a.value(i), b.value(i));
    }
    return {};
}

QImage pictureOf(const Canvas& canvas)
{
    QImage image(1280, 720, QImage::Format_ARGB32_Premultiplied);
    image.fill(Qt::transparent);
    QPainter painter(&image);
    painter.setRenderHint(QPainter::Antialiasing);
    canvas.scene->render(&painter, QRectF(0, 0, 1280, 720), QRectF(0, 0, 1280, 720));
    return image;
}

// Pixels that differ by more than the rounding of a place allows.
int differingPixels(const QImage& a, const QImage& b)
{
    constexpr int ROUNDING = 8;
    int differing = 0;
    for (int y = 0; y < a.height(); ++y) {
        const auto* p = reinterpret_cast<const QRgb*>(a.constScanLine(y));
        const auto* q = reinterpret_cast<const QRgb*>(b.constScanLine(y));
        for (int x = 0; x < a.width(); ++x) {
            differing +=
                p[x] != q[x] &&
                (qAbs(qRed(p[x]) - qRed(q[x])) > ROUNDING || qAbs(qGreen(p[x]) - qGreen(q[x])) > ROUNDING ||
                 qAbs(qBlue(p[x]) - qBlue(q[x])) > ROUNDING || qAbs(qAlpha(p[x]) - qAlpha(q[x])) > ROUNDING);
        }
    }
    return differing;
}

QList<TText> someTexts()
{
    TText first = makeRecord(QString::fromUtf8("First 快\nline"), 1, "KST", 60);
    first.setTextAlign(1);
    TText second = makeRecord("Second", 3, "DejaVu Sans", 48);
    second.setXValue(500.0F);
    second.setYValue(300.0F);
    second.setZValue(2.0F);
    second.setShadowStyle(1);
    second.getTextShadow()->setShadowDirectionX(1);
    second.getTextShadow()->setShadowDirectionY(1);
    return {first, second};
}

// The expected state of one object at one place of the stack.
struct Object {
    explicit Object(GraphicsText* item) : typing(item->isTyping())
    {
        TText shown = *item->getItemTText();
        place = QString("%1 %2 %3").arg(shown.getXValue()).arg(shown.getYValue()).arg(shown.getZValue());
        shown.setXValue(0.0F);
        shown.setYValue(0.0F);
        carried = StyleProperties::describe(*item->getLastAlpaTextStyleValue());
        if (shown.textItems().empty()) {
            carried += StyleProperties::describe(shown);
            shown.setTextShadow(TShadow());
        }
        record = StyleProperties::describe(shown);
    }
    QString place;
    QString record;
    // Changes without a step: typing that is taken back at once leaves the style of its last character for
    // the next one, and its shadow to an object without characters.
    QString carried;
    bool typing;
};

using Objects = std::map<int, Object>;

Objects objectsOf(const Canvas& canvas)
{
    Objects objects;
    const QList<GraphicsText*> texts = canvas.scene->getTextItemList();
    for (GraphicsText* item : texts)
        objects.emplace(item->getItemTText()->getTextObjectID(), Object(item));
    return objects;
}

// Keeps what the canvas looked like at each place of the stack.
class History
{
public:
    explicit History(Canvas& canvas) : m_canvas(canvas)
    {
        m_places.push_back(Place(objectsOf(canvas)));
        // Connected after the stack, so it sees what the command has left.
        QObject::connect(canvas.scene.get(), &CanvasScene::signalPushUndoCommandIntoStack, &canvas.stack,
                         [this] { pushed(); });
    }

    // Call after each edit.
    void edited()
    {
        Place& place = m_places[size_t(m_index)];
        for (const auto& [id, object] : objectsOf(m_canvas)) {
            const auto known = place.objects.find(id);
            if (known != place.objects.end() && known->second.record == object.record)
                place.carried.emplace(id, object.carried);
        }
    }
    // What differs from how the canvas was at this place of the stack; empty when nothing does.
    QString wrong()
    {
        const Objects now = objectsOf(m_canvas);
        const Objects& then = m_places[size_t(m_index)].objects;
        if (now.size() != then.size())
            return QString("place %1: %2 objects, should be %3")
                .arg(m_index)
                .arg(now.size())
                .arg(then.size());
        for (const auto& [id, object] : now) {
            const auto known = then.find(id);
            if (known == then.end())
                return QString("place %1: object %2 should not be there").arg(m_index).arg(id);
            QString wrong = difference(object.place, known->second.place);
            if (wrong.isEmpty())
                wrong = difference(object.record, known->second.record);
            if (wrong.isEmpty() && !wasCarried(id, object))
                wrong = difference(object.carried, known->second.carried);
            if (!wrong.isEmpty())
                return QString("place %1, object %2: %3").arg(m_index).arg(id).arg(wrong);
        }
        // Later steps may cut off the place of the stack from which it was carried.
        edited();
        return {};
    }

    void undo()
    {
        m_canvas.stack.undo();
        m_index = m_canvas.stack.index();
    }
    void redo()
    {
        m_canvas.stack.redo();
        m_index = m_canvas.stack.index();
    }

private:
    struct Place {
        explicit Place(const Objects& shown) : objects(shown)
        {
            for (const auto& [id, object] : objects)
                carried.emplace(id, object.carried);
        }
        Objects objects;
        std::set<std::pair<int, QString>> carried;
    };

    // Steps of other objects, and moves, do not change the carried state of an object.
    bool wasCarried(int id, const Object& object) const
    {
        const auto unchangedAt = [&](int index) {
            const Objects& objects = m_places[size_t(index)].objects;
            const auto known = objects.find(id);
            return known != objects.end() && known->second.record == object.record;
        };
        const auto carriedAt = [&](int index) {
            return m_places[size_t(index)].carried.count({id, object.carried}) > 0;
        };
        for (int i = m_index; i >= 0 && unchangedAt(i); --i)
            if (carriedAt(i))
                return true;
        for (int i = m_index + 1; i < int(m_places.size()) && unchangedAt(i); ++i)
            if (carriedAt(i))
                return true;
        return false;
    }
    void pushed()
    {
        m_places.resize(size_t(m_index) + 1, Place({}));
        Objects shown = objectsOf(m_canvas);
        // Unfinished typing is not an undo step yet; undo goes back to before it.
        for (auto& [id, object] : shown) {
            const auto before = m_places.back().objects.find(id);
            if (object.typing && before != m_places.back().objects.end())
                object = before->second;
        }
        m_places.push_back(Place(shown));
        ++m_index;
        // The stack has dropped its oldest commands.
        for (; m_index > m_canvas.stack.index(); --m_index)
            m_places.pop_front();
    }

    Canvas& m_canvas;
    std::deque<Place> m_places;
    int m_index = 0;
};

// The state of a run: the documents, the file, the picture.
struct End {
    explicit End(const Canvas& canvas) : file(fileOf(canvas)), picture(pictureOf(canvas))
    {
        const QList<GraphicsText*> texts = textsById(canvas);
        for (const GraphicsText* item : texts)
            documents.append(item->toPlainText());
    }
    QStringList documents;
    QString file;
    QImage picture;
};

void compare(const End& now, const End& then)
{
    QCOMPARE(now.documents, then.documents);
    QCOMPARE(difference(now.file, then.file), QString());
    QCOMPARE(differingPixels(now.picture, then.picture), 0);
}

bool everyTextInStep(const Canvas& canvas)
{
    const QList<GraphicsText*> texts = canvas.scene->getTextItemList();
    return std::all_of(texts.begin(), texts.end(), [](const GraphicsText* item) { return inStep(*item); });
}

void ignoreDebug(QtMsgType type, const QMessageLogContext&, const QString& text)
{
    if (type != QtDebugMsg && !text.startsWith(QLatin1String("Mouse event")))
        fprintf(stderr, "%s\n", qPrintable(text));
}

} // namespace

void tst_canvasscene_undo::initTestCase()
{
    qRegisterMetaType<TText*>("TText*");
    m_edits = runLength("TITLER_EDITS", DEFAULT_EDITS);
    qInfo("seed %u, %d edits", quint32(RandomSeed(DEFAULT_SEED)), m_edits);
    // Hides the log lines for saving, which would fill the output.
    qInstallMessageHandler(ignoreDebug);
}

void tst_canvasscene_undo::init()
{
    messages = new FakeMessageBoxController;
    InputLanguageFonts::resetLastFonts();
    InputLanguageFonts::mInputLanguage = 2;
    InputLanguageFonts::IS_CN_MODULE = false;
}

void tst_canvasscene_undo::cleanup()
{
    delete messages;
    messages = nullptr;
}

void tst_canvasscene_undo::undoAllRedoAll()
{
    QElapsedTimer clock;
    clock.start();
    Canvas canvas;
    canvas.open(someTexts());
    canvas.scene->saveArchive();
    History history(canvas);
    const RandomSeed seed(DEFAULT_SEED);
    RandomEditor operator_(canvas, seed, 16);
    const End start(canvas);
    for (int i = 0; i < m_edits; ++i) {
        operator_.edit();
        history.edited();
        if (!everyTextInStep(canvas))
            QFAIL(qPrintable(QString("edit %1 left a text out of step").arg(i)));
        QVERIFY(canvas.scene->getTextItemList().size() <= 4);
    }
    operator_.leave();
    canvas.scene->slotDeleteEmptyItems();
    canvas.scene->saveArchive();
    QCOMPARE(history.wrong(), QString());
    const End end(canvas);
    const int steps = canvas.stack.count();
    const qint64 edited = clock.restart();
    while (canvas.stack.canUndo()) {
        history.undo();
        QCOMPARE(history.wrong(), QString());
    }
    operator_.leave();
    compare(End(canvas), start);
    if (QTest::currentTestFailed())
        return;
    const qint64 undone = clock.restart();
    while (canvas.stack.canRedo()) {
        history.redo();
        QCOMPARE(history.wrong(), QString());
    }
    operator_.leave();
    compare(End(canvas), end);
    qInfo("seed %u: %d edits, %d steps; edited in %lld ms, undone in %lld, redone in %lld", quint32(seed),
          m_edits, steps, edited, undone, clock.elapsed());
}

// With the window's limit, longer texts, and undo and redo in between that cut branches off.
void tst_canvasscene_undo::shortHistory()
{
    Canvas canvas;
    canvas.stack.setUndoLimit(WINDOW_UNDO_LIMIT);
    canvas.open(someTexts());
    canvas.scene->saveArchive();
    History history(canvas);
    const RandomSeed seed(DEFAULT_SEED);
    RandomEditor operator_(canvas, seed + 1, 60);
    const int rounds = qMax(1, m_edits / 100);
    for (int round = 0; round < rounds; ++round) {
        for (int i = 0; i < 20; ++i) {
            operator_.edit();
            history.edited();
        }
        operator_.leave();
        QVERIFY(canvas.stack.count() <= WINDOW_UNDO_LIMIT);
        const int back = operator_.below(WINDOW_UNDO_LIMIT + 3);
        const int forth = operator_.below(back + 1);
        for (int i = 0; i < back && canvas.stack.canUndo(); ++i) {
            history.undo();
            QCOMPARE(history.wrong(), QString());
        }
        for (int i = 0; i < forth && canvas.stack.canRedo(); ++i) {
            history.redo();
            QCOMPARE(history.wrong(), QString());
        }
        operator_.leave();
    }
    canvas.scene->saveArchive();
    const End end(canvas);
    const int redoable = canvas.stack.count() - canvas.stack.index();
    while (canvas.stack.canUndo())
        history.undo();
    while (canvas.stack.count() - canvas.stack.index() > redoable)
        history.redo();
    operator_.leave();
    compare(End(canvas), end);
}

// A change of the selected title at a clean stack is no step, so it cannot cut off what may be redone.
void tst_canvasscene_undo::focusCommandsOnACleanStack()
{
    Canvas canvas;
    canvas.stack.setUndoLimit(WINDOW_UNDO_LIMIT);
    canvas.open(someTexts());
    canvas.scene->saveArchive();
    const auto push = [&canvas](QUndoCommand* command) {
        if (canvas.stack.isClean() && command->id() == FOCUS_COMMAND_ID)
            delete command;
        else
            canvas.stack.push(command);
    };
    History history(canvas);
    const RandomSeed seed(DEFAULT_SEED);
    RandomEditor operator_(canvas, seed + 2, 16);
    QList<int> ids;
    connect(canvas.scene.get(), &CanvasScene::signalPushUndoCommandIntoStack, this,
            [&ids](const QUndoCommand* command) { ids.append(command->id()); });
    push(new FocusCommand);
    QCOMPARE(canvas.stack.count(), 0);
    const End start(canvas);
    while (canvas.stack.count() < WINDOW_UNDO_LIMIT - 1) {
        operator_.edit();
        operator_.leave();
        history.edited();
    }
    canvas.scene->saveArchive();
    const End end(canvas);
    const int steps = canvas.stack.count();
    while (canvas.stack.canUndo()) {
        history.undo();
        QCOMPARE(history.wrong(), QString());
    }
    operator_.leave();
    compare(End(canvas), start);
    QVERIFY(canvas.stack.isClean());
    push(new FocusCommand);
    QCOMPARE(canvas.stack.count(), steps);
    while (canvas.stack.canRedo()) {
        history.redo();
        QCOMPARE(history.wrong(), QString());
    }
    operator_.leave();
    compare(End(canvas), end);
    // No command of the canvas has the same id, and no two of them are merged.
    QVERIFY(ids.size() >= steps);
    QCOMPARE(ids.count(-1), ids.size());
    push(new FocusCommand);
    QCOMPARE(canvas.stack.count(), qMin(steps + 1, WINDOW_UNDO_LIMIT));
}

QTEST_MAIN(tst_canvasscene_undo)
#include "tst_canvasscene_undo.moc"
