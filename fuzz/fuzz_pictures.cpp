// A picture file of any bytes, under the name that its first byte chooses: it is measured and reduced as a
// picture that an operator brings in. The limits on memory that the fuzzer runs with are part of the test.
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
        std::abort(); // what was checked is not what was decoded
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
