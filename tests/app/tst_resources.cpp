// Every picture that the sources name is compiled in.
#include <QDirIterator>
#include <QFile>
#include <QImage>
#include <QRegularExpression>
#include <QSet>
#include <QTest>

namespace
{

// Names that are put together at run time are listed where they are used; these are patterns, not names.
bool isPattern(const QString& path)
{
    return path.contains(QLatin1Char('%')) || path.endsWith(QLatin1Char('_')) ||
           path.endsWith(QLatin1Char('/'));
}

QMap<QString, QString> namedPictures()
{
    static const QRegularExpression literal(QStringLiteral("\"(:/[^\"\\s<]+)\"|url\\((:/[^)\\s]+)\\)"));
    QMap<QString, QString> names;
    for (const char* folder :
         {"support", "messaging", "document", "touchui", "canvas", "panel", "library", "app"}) {
        QDirIterator files(QStringLiteral(TITLER_SOURCE_DIR "/") + QLatin1String(folder),
                           {QStringLiteral("*.h"), QStringLiteral("*.cpp")}, QDir::Files,
                           QDirIterator::Subdirectories);
        while (files.hasNext()) {
            QFile file(files.next());
            if (!file.open(QIODevice::ReadOnly)) {
                continue;
            }
            auto matches = literal.globalMatch(QString::fromUtf8(file.readAll()));
            while (matches.hasNext()) {
                const auto match = matches.next();
                names.insert(match.captured(1) + match.captured(2), file.fileName());
            }
        }
    }
    return names;
}

} // namespace

class TestResources : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();
    void namedPicturesExist();
    void framesAreComplete();
    void buttonFamiliesAreComplete();
    void toolIconsHaveTheirSize();
    void canvasFrameSurroundsTheCanvas();
};

void TestResources::initTestCase()
{
    Q_INIT_RESOURCE(TitlerToolResource);
    Q_INIT_RESOURCE(UILibrary);
}

void TestResources::namedPicturesExist()
{
    const QMap<QString, QString> names = namedPictures();
    int checked = 0;
    QStringList missing;
    for (auto name = names.begin(); name != names.end(); ++name) {
        if (isPattern(name.key())) {
            continue;
        }
        ++checked;
        if (QImage(name.key()).isNull()) {
            missing.append(name.key() + QStringLiteral(" in ") + name.value());
        }
    }
    QVERIFY2(missing.isEmpty(), qPrintable(missing.join(QLatin1Char('\n'))));
    QVERIFY(checked > 0);
}

void TestResources::framesAreComplete()
{
    for (const char* prefix : {":/PanelBG/Pane_1_", ":/PanelBG/Pane_2_", ":/PanelBG/Dialog_base_"}) {
        for (const char* row : {"Upper", "Middle", "Bottom"}) {
            for (const char* column : {"_Left", "_Center", "_Right"}) {
                const QString name = QLatin1String(prefix) + QLatin1String(row) + QLatin1String(column);
                QVERIFY2(!QImage(name).isNull(), qPrintable(name));
            }
        }
    }
    for (const char* row : {"Upper", "Middle", "bottom"}) {
        for (const char* column : {"_Left", "_Center", "_Right"}) {
            const QString name =
                QStringLiteral(":/dialog_base/dialog_base_") + QLatin1String(row) + QLatin1String(column);
            QVERIFY2(!QImage(name).isNull(), qPrintable(name));
        }
    }
}

void TestResources::buttonFamiliesAreComplete()
{
    const struct {
        const char* family;
        int height;
    } families[] = {
        {"Button_48", 48}, {"Button_48selected", 48}, {"Button-38B", 38}, {"Button-38selected", 38}};
    for (const auto& family : families) {
        for (const char* state : {"_Rest", "_Pressed", "_Disabled"}) {
            for (const char* piece : {"_Left", "_Center", "_Right"}) {
                const QString name = QStringLiteral(":/TextToolPanel_Buttons/") +
                                     QLatin1String(family.family) + QLatin1String(state) +
                                     QLatin1String(piece);
                QCOMPARE(QImage(name).height(), family.height);
            }
        }
    }
}

void TestResources::toolIconsHaveTheirSize()
{
    for (const char* name : {"Folder", "Text", "Delete", "Undo", "Redo"}) {
        const QImage icon(QStringLiteral(":/Icon_") + QLatin1String(name));
        const QImage disabled(QStringLiteral(":/Icon_Disabled_") + QLatin1String(name));
        QCOMPARE(icon.size(), QSize(120, 67));
        QCOMPARE(disabled.size(), QSize(120, 67));
        QVERIFY(icon != disabled);
    }
    for (const char* name : {"SafeArea", "Canvas", "Close"}) {
        QCOMPARE(QImage(QStringLiteral(":/Icon_") + QLatin1String(name)).size(), QSize(120, 67));
    }
}

void TestResources::canvasFrameSurroundsTheCanvas()
{
    const QImage frame(QStringLiteral(":/PanelBG/Titler_Canvas"));
    const QPoint canvas = QPoint(609, 97) - QPoint(579, 75);
    // The checkers fill exactly the canvas, and a rim goes round it.
    QSet<QRgb> inside;
    for (const QPoint& corner : {QPoint(0, 0), QPoint(1279, 0), QPoint(0, 719), QPoint(1279, 719)}) {
        inside.insert(frame.pixel(canvas + corner));
    }
    QVERIFY(inside.size() <= 2);
    for (const QPoint& beside : {QPoint(-1, 0), QPoint(1280, 0), QPoint(0, -1), QPoint(0, 720)}) {
        QVERIFY(!inside.contains(frame.pixel(canvas + beside)));
        QCOMPARE(qAlpha(frame.pixel(canvas + beside)), 255);
    }
    QCOMPARE(qAlpha(frame.pixel(0, 0)), 0);
    QVERIFY(75 + frame.height() <= 845); // over the ruler below
}

QTEST_MAIN(TestResources)
#include "tst_resources.moc"
