#pragma once

#include <QPointer>
#include <QString>

class GraphicsText;
class QWidget;

// Opens and closes the soft keyboard for the text objects of a scene. GUI thread only.
class SceneKeyboard
{
public:
    // Sets the object for the next request; null closes the keyboard.
    void setItem(GraphicsText* item) { m_item = item; }
    // Marks the next request as one for a new object: the keyboard starts with a cleared state.
    void expectNewText() { m_isNewText = true; }

    // Opens the keyboard with a description of the object, or closes it. view: the widget that shows the
    // object; with null nothing is opened. title: the title of the keyboard.
    void request(QWidget* view, const QString& title);

private:
    QString description(const QString& title);

    QPointer<GraphicsText> m_item;
    bool m_isNewText = false;
};
