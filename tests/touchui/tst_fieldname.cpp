#include "touchui/FieldName.h"

#include <QTest>

using SubCommonDefine::tagSoftKeyBoardInitData;

class tst_fieldname : public QObject
{
    Q_OBJECT
private Q_SLOTS:
    void writesElevenParts()
    {
        tagSoftKeyBoardInitData data;
        data.title = L"Text Input";
        data.keyboardType = 1;
        data.maxLength = 300;
        data.text = L"晚间";
        data.textLength = 2;
        data.selectionStart = -1;
        data.selectionMode = 2;
        data.limitCondition = L"^[0-9]$";
        data.lastValue = 299;
        QCOMPARE(FieldName::write(data), QStringLiteral("0#Text Input#1#300#晚间#2#-1#0#2#^[0-9]$#299"));
    }

    void readsWhatItWrites_data()
    {
        QTest::addColumn<QString>("text");
        QTest::newRow("empty") << "";
        QTest::newRow("plain") << "Title";
        QTest::newRow("separators") << "#a##b#";
        QTest::newRow("like a field") << "0#Text Input#1#300#a#b#4#2#4#1##299";
    }

    void readsWhatItWrites()
    {
        QFETCH(QString, text);
        tagSoftKeyBoardInitData data;
        data.fieldKind = 1;
        data.title = L"T";
        data.keyboardType = 3;
        data.text = text.toStdWString();
        data.textLength = -1;
        data.selectionStart = 4;
        data.selectionEnd = 5;
        data.selectionMode = 1;
        data.limitCondition = L"x+";
        data.lastValue = 7;
        const QString name = FieldName::write(data);
        tagSoftKeyBoardInitData read;
        FieldName::read(name, read);
        QCOMPARE(FieldName::write(read), name);
        QCOMPARE(QString::fromStdWString(read.text), text);
        QCOMPARE(read.selectionEnd, 5);
        QCOMPARE(read.lastValue, 7);
    }

    void readsTheShortForm_data()
    {
        QTest::addColumn<QString>("name");
        QTest::addColumn<int>("keyboard");
        QTest::addColumn<int>("mode");
        QTest::addColumn<int>("last");
        QTest::newRow("none") << "" << 0 << 0 << 300;
        QTest::newRow("no separator") << "2" << 0 << 0 << 300;
        QTest::newRow("two") << "2#T" << 2 << 0 << 300;
        QTest::newRow("three") << "2#T#1" << 2 << 2 << 300;
        QTest::newRow("four") << "2#T#1#5" << 2 << 1 << 5;
        QTest::newRow("ten") << "2#T#1#5#6#7#8#9#10#11" << 2 << 1 << 5;
        QTest::newRow("no numbers") << "a#T#b#c" << 0 << 0 << 300;
    }

    void readsTheShortForm()
    {
        QFETCH(QString, name);
        tagSoftKeyBoardInitData data;
        FieldName::read(name, data);
        QTEST(data.keyboardType, "keyboard");
        QTEST(data.selectionMode, "mode");
        QTEST(data.lastValue, "last");
        QCOMPARE(data.title, name.count('#') > 0 ? std::wstring(L"T") : std::wstring());
        QCOMPARE(data.text, std::wstring());
    }
};

QTEST_APPLESS_MAIN(tst_fieldname)

#include "tst_fieldname.moc"
