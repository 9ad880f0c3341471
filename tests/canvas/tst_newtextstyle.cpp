#include "canvas/NewTextStyle.h"

#include "canvas/InputLanguageFonts.h"
#include "canvas/TextObjectConstants.h"
#include "document/FontStyle.h"

#include <QTest>

// The style that a new text object starts with.
class tst_newtextstyle : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void family_data();
    void family();
    void aNewLanguageCountsOnce();
    void aChosenFamilyEndsThatOfTheModel();
    void shadowAndAlignAreThoseOfThePanel();
};

namespace
{

constexpr int JAPANESE = 2; // row of the font tables
const QString FAMILY_OF_MODEL = QStringLiteral("DFHeiW5-A");

FontStyle rememberedStyle()
{
    FontStyle style;
    style.setFamily("Remembered");
    style.setSize(72);
    return style;
}

TText shown(const char* family)
{
    auto character = std::make_unique<TextStyle>();
    character->setFontFamily(family);
    character->setFontSize(40);
    TText record;
    record.setTextAlign(1);
    record.setTextItems({character.release()});
    return record;
}

std::string familyOf(const NewTextStyle::FirstCharacter& first)
{
    return first.record.textItems().front()->getFontFamily();
}

} // namespace

void tst_newtextstyle::init()
{
    InputLanguageFonts::resetLastFonts();
}

void tst_newtextstyle::family_data()
{
    QTest::addColumn<bool>("model");
    QTest::addColumn<bool>("newLanguage");
    QTest::addColumn<QString>("panel"); // empty: it reports nothing
    QTest::addColumn<QString>("family");
    QTest::addColumn<int>("ensureMode");
    const QString none;
    const QString japanese = QStringLiteral("KST Japanese Pro");
    QTest::newRow("remembered") << false << false << none << "Remembered" << 2;
    QTest::newRow("of the model") << true << false << none << FAMILY_OF_MODEL << 0;
    QTest::newRow("of a new language") << false << true << none << japanese << 1;
    QTest::newRow("of model before language") << true << true << none << FAMILY_OF_MODEL << 0;
    QTest::newRow("of the panel") << false << false << "Shown"
                                  << "Shown" << 2;
    QTest::newRow("of the panel before the model") << true << false << "Shown"
                                                   << "Shown" << 2;
    QTest::newRow("of the panel before a new language") << false << true << "Shown"
                                                        << "Shown" << 2;
    QTest::newRow("of the panel, which is that of the language")
        << false << true << japanese << japanese << 1;
}

void tst_newtextstyle::family()
{
    QFETCH(bool, model);
    QFETCH(bool, newLanguage);
    QFETCH(QString, panel);
    QFETCH(QString, family);
    QFETCH(int, ensureMode);
    NewTextStyle style(QStringLiteral("ab"), rememberedStyle());
    if (model)
        style.setFamilyOfModel(FAMILY_OF_MODEL);
    if (newLanguage)
        style.setLanguageRow(JAPANESE);
    style.askPanel();
    if (!panel.isEmpty())
        style.rememberProperty(shown(panel.toUtf8().constData()));
    const NewTextStyle::FirstCharacter first = style.firstCharacter();
    QCOMPARE(QString::fromStdString(familyOf(first)), family);
    QCOMPARE(first.ensureMode, ensureMode);
    QCOMPARE(first.record.textItems().size(), size_t(1));
    QCOMPARE(first.record.textItems().front()->getText(), std::string());
    QCOMPARE(first.record.textItems().front()->getFontSize(), panel.isEmpty() ? 72 : 40);
}

void tst_newtextstyle::aNewLanguageCountsOnce()
{
    NewTextStyle style(QStringLiteral("ab"), rememberedStyle());
    style.setLanguageRow(JAPANESE);
    style.setLanguageRow(JAPANESE);
    QCOMPARE(style.languageRow(), JAPANESE);
    QCOMPARE(style.firstCharacter().ensureMode, 1);
    QCOMPARE(style.firstCharacter().ensureMode, 2);
    style.setLanguageRow(0);
    style.propertyChanged(TextObjectConstants::PropertyBold);
    QCOMPARE(style.firstCharacter().ensureMode, 2);
}

void tst_newtextstyle::aChosenFamilyEndsThatOfTheModel()
{
    NewTextStyle style(QStringLiteral("ab"), rememberedStyle());
    style.setFamilyOfModel(FAMILY_OF_MODEL);
    style.propertyChanged(TextObjectConstants::PropertySize);
    QCOMPARE(style.firstCharacter().ensureMode, 0);
    style.propertyChanged(TextObjectConstants::PropertyFamily);
    QCOMPARE(familyOf(style.firstCharacter()), std::string("Remembered"));
}

void tst_newtextstyle::shadowAndAlignAreThoseOfThePanel()
{
    NewTextStyle style(QStringLiteral("ab"), rememberedStyle());
    TText change = shown("Changed");
    change.setTextAlign(0);
    style.rememberProperty(shown("Shown"));
    style.rememberChange(change);
    TText record;
    style.applyTo(record);
    QCOMPARE(record.getTextAlign(), 1);
    QCOMPARE(style.lastTextStyle().getTextAlign(), 0);
    // A record without characters leaves the family.
    style.rememberChange(TText());
    QCOMPARE(familyOf(style.firstCharacter()), std::string("Changed"));
}

QTEST_MAIN(tst_newtextstyle)
#include "tst_newtextstyle.moc"
