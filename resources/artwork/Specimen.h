#pragma once

#include <QImage>
#include <QList>

// Pages to be looked at while drawing: the pictures as they are seen in use.
namespace Specimen
{

// Every picture by itself, with its name.
QImage sheet();
// Faces and frames put together at several sizes, with labels and icons on them.
QImage faces();
QImage frames();

} // namespace Specimen
