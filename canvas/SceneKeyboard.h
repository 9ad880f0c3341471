#pragma once

#include <QPointer>
#include <QString>

class GraphicsText;
class QWidget;

// Asks for the soft keyboard on behalf of the text objects of a scene. GUI thread only.
class SceneKeyboard
{
public:
    // The object that the next request is for; null closes the keyboard.
    void setItem(GraphicsText* item) { m_item = item; }
    // The next request is for a new object: the keyboard starts afresh.
    void expectNewText() { m_isNewText = true; }

    // Opens the keyboard for the object, which describes itself to it, or closes it. view: the widget that
    // shows the object; null: nothing is opened. title: that of the keyboard.
    void request(QWidget* view, const QString& title);

private:
    QString description(const QString& title);

    QPointer<GraphicsText> m_item;
    bool m_isNewText = false;
};
