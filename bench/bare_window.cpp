// The least that a program with a full-screen window costs: shows an empty window, hides it and ends. With
// --stay the window stays until the process is ended.
#include <QApplication>
#include <QEvent>
#include <QWidget>
#include <cstdio>
#include <cstring>

namespace
{

constexpr int WIDTH = 1920;
constexpr int HEIGHT = 1080;

class BareWindow : public QWidget
{
public:
    explicit BareWindow(bool stay) : m_stay(stay)
    {
        setWindowTitle(QStringLiteral("bare_window"));
        resize(WIDTH, HEIGHT);
    }

protected:
    void paintEvent(QPaintEvent*) override
    {
        if (!m_stay)
            QMetaObject::invokeMethod(this, &BareWindow::finish, Qt::QueuedConnection);
    }

private:
    void finish()
    {
        hide();
        std::puts("hidden");
        std::fflush(stdout);
        QApplication::quit();
    }

    bool m_stay;
};

} // namespace

int main(int argc, char* argv[])
{
    QApplication application(argc, argv);
    BareWindow window(argc > 1 && std::strcmp(argv[1], "--stay") == 0);
    window.show();
    return QApplication::exec();
}
