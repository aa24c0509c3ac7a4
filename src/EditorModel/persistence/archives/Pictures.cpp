// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/persistence/archives/Pictures.h>

#include <EditorModel/persistence/Fields.h>
#include <EditorModel/types/Image.h>

#include <QBuffer>
#include <QGuiApplication>
#include <QImageReader>

#include <stdexcept>

namespace Serialize::Details {
namespace {

/// The largest picture that is read: 8192 by 8192, a quarter of a gigabyte.
constexpr qint64 maxPixels = qint64(1) << 26;

void visitBytes(Fields& fields, void* object)
{
    auto& bytes = *static_cast<QByteArray*>(object);
    int size = bytes.size();
    fields("size", size);
    if (size < 0)
        throw std::runtime_error("a size of " + std::to_string(size) + " bytes");
    fields.binary(bytes, size);
}

const Type& bytesType()
{
    static const Type type{typeid(QByteArray), &visitBytes, boost::serialization::guid<QByteArray>(), true};
    return type;
}

void visitPixmap(Fields& fields, void* object)
{
    auto& pixmap = *static_cast<QPixmap*>(object);
    QByteArray png;
    if (!fields.loading())
        png = pngOf(pixmap);
    fields.object("png", bytesType(), &png);
    if (fields.loading())
        pixmap = pixmapOfPng(png);
}

const Type& pixmapType()
{
    static const Type type{typeid(QPixmap), &visitPixmap, boost::serialization::guid<QPixmap>(), true};
    return type;
}

void visitPicture(Fields& fields, void* object)
{
    fields.object("image", pixmapType(), static_cast<QPixmap*>(static_cast<Types::Image*>(object)));
}

void* createPicture()
{
    requirePictures();
    return new Types::Image;
}

void destroyPicture(void* object)
{
    delete static_cast<Types::Image*>(object);
}

Types::Image*& picture(const PointerField& field)
{
    return *static_cast<Types::Image**>(field.slot);
}

constexpr PointerAccess pictureAccess{
    [](const PointerField& field) {
        return Pointee{picture(field), &pictureType()};
    },
    [](const PointerField&) -> const ISerializable* { return nullptr; },
    [](const PointerField& field, const Pointee& read) {
        if (read.object && read.type != &pictureType())
            throw std::bad_cast();
        picture(field) = static_cast<Types::Image*>(read.object);
    },
    [](const PointerField&, ISerializable*) { throw std::bad_cast(); },
};

void visitShared(Fields& fields, void* object)
{
    auto& shared = *static_cast<std::shared_ptr<const Types::Image>*>(object);
    auto* image = const_cast<Types::Image*>(shared.get());
    fields.pointer("px", PointerField{pictureAccess, &pictureType(), &image, false});
    if (fields.loading())
        shared = image ? fields.share(image) : nullptr;
}

} // namespace

const Type& pictureType()
{
    static const Type type{
        typeid(Types::Image), &visitPicture,  boost::serialization::guid<Types::Image>(), true, true, 0,
        &createPicture,       &destroyPicture};
    static const TypeEntry entry(type);
    return type;
}

const Type& sharedPictureType()
{
    static const Type type{
        typeid(std::shared_ptr<const Types::Image>), &visitShared, nullptr, false, true, 1};
    return type;
}

QByteArray pngOf(const QPixmap& pixmap)
{
    QByteArray png;
    QBuffer buffer(&png);
    buffer.open(QIODevice::WriteOnly);
    // A null pixmap has no PNG form: it is stored as no bytes.
    if (!pixmap.isNull() && !pixmap.save(&buffer, "PNG", -1))
        throw std::runtime_error("a picture cannot be written as PNG");
    return png;
}

QPixmap pixmapOfPng(const QByteArray& png)
{
    requirePictures();
    if (png.isEmpty())
        return QPixmap();
    QBuffer buffer;
    buffer.setData(png);
    // Whatever else is installed to read pictures is not asked.
    QImageReader reader(&buffer, "PNG");
    reader.setAutoDetectImageFormat(false);
    const QSize size = reader.size();
    if (!size.isValid())
        throw std::runtime_error("the data of a picture is no picture");
    // Deflate packs at most 1032 bytes into one, and a byte holds at most eight pixels.
    const qint64 pixels = qint64(size.width()) * size.height();
    if (pixels > qint64(png.size()) * 1032 * 8 || pixels > maxPixels)
        throw std::runtime_error("a picture claims to be " + std::to_string(size.width()) + " by " +
                                 std::to_string(size.height()) + " pixels, more than its data can hold");
    const QPixmap pixmap = QPixmap::fromImageReader(&reader);
    if (pixmap.isNull())
        throw std::runtime_error("the data of a picture is no picture");
    return pixmap;
}

void requirePictures()
{
    if (!qobject_cast<QGuiApplication*>(QCoreApplication::instance()))
        throw std::runtime_error("a picture needs a QGuiApplication");
}

} // namespace Serialize::Details
