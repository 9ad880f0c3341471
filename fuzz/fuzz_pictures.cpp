// Measures and scales down a picture file of random bytes, like a picture that the operator imports. The
// first byte selects its name. The fuzzer's memory limits are part of the test.
#include "FuzzFolder.h"
#include "document/ImageResizer.h"
#include "document/PictureReader.h"

#include <QGuiApplication>
#include <QImage>
#include <QSize>
#include <QString>
#include <iterator>

namespace
{

const char* const EXTENSIONS[] = {".png", ".bmp", ".jpg", ".gif", ".jpe", ".tif", ".xpm", ".svg"};

void makeApplication()
{
    ::setenv("QT_QPA_PLATFORM", "offscreen", 0);
    static int count = 1;
    static char name[] = "fuzz";
    static char* arguments[] = {name, nullptr};
    static QGuiApplication application(count, arguments);
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size)
{
    makeApplication();
    if (size == 0)
        return 0;
    const std::string folder = FuzzFolder::instance().base() + "/titles";
    const std::string path = folder + "/picture" + EXTENSIONS[data[0] % std::size(EXTENSIONS)];
    FuzzFolder::write(path, FuzzFolder::view(data + 1, size - 1));
    std::wstring source(path.begin(), path.end());
    std::wstring black(folder.begin(), folder.end());
    std::wstring small = black + L"/small.png";
    black += L"/black.png";
    const PictureReader reader(QString::fromStdString(path));
    const QImage picture = reader.read();
    if (!picture.isNull() && picture.size() != reader.size())
        std::abort(); // the decoded size is not the one that was checked
    reader.read(QSize(240, 135));
    ImageResizer resizer;
    if (resizer.isAvailableImage(source)) {
        resizer.getImageWidth(source);
        resizer.getImageHeight(source);
        resizer.resizeImageToThumbnail(source, black, small, 240, 135);
    }
    ::unlink(path.c_str());
    return 0;
}
