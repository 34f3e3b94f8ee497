// Base class of plug-in cache file formats.
//
// The host writes a cache as a header, then one chunk per time: the time and
// each channel's name and array. It reads it back the same way, finding a
// time or a channel before reading its data. The host's defaults read and
// write nothing: the steps report kNotImplemented, the readers return 0.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VDoubleArray.h>
#include <openvorla/VIntArray.h>
#include <openvorla/VStatus.h>
#include <openvorla/VString.h>
#include <openvorla/VTime.h>

OPENVORLA_NAMESPACE_OPEN

class VCacheFormatDescription;
class VFloatArray;
class VFloatVectorArray;
class VVectorArray;

class OPENVORLA_EXPORT VPxCacheFormat {
public:
  enum FileAccessMode {
    kRead,
    kWrite,
    kReadWrite
  };

  VPxCacheFormat();
  virtual ~VPxCacheFormat();

  virtual VStatus open(const VString &fileName, FileAccessMode mode);
  virtual void close();
  // Whether the open file is a cache of this format.
  virtual VStatus isValid();
  // Back to the first chunk.
  virtual VStatus rewind();
  // The extension of the format's files, without a leading '.'; "" by default.
  virtual VString extension();
  // Writes what is buffered to the file; nothing is buffered by default.
  virtual void flush();

  virtual VStatus readHeader();
  virtual VStatus writeHeader(const VString &version, VTime &startTime, VTime &endTime);

  virtual VStatus writeTime(VTime &time);
  virtual VStatus readTime(VTime &time);
  // The chunk of time, or else of the first time after it, which is put in
  // foundTime.
  virtual VStatus findTime(VTime &time, VTime &foundTime);
  virtual VStatus readNextTime(VTime &foundTime);

  virtual VStatus writeChannelName(const VString &name);
  // Moves to the channel of that name in the current chunk.
  virtual VStatus findChannelName(const VString &name);

  // The size of the array that follows in the file.
  virtual unsigned int readArraySize();
  virtual VStatus writeDoubleArray(const VDoubleArray &array);
  virtual VStatus writeFloatArray(const VFloatArray &array);
  virtual VStatus writeIntArray(const VIntArray &array);
  virtual VStatus writeDoubleVectorArray(const VVectorArray &array);
  virtual VStatus writeFloatVectorArray(const VFloatVectorArray &array);
  virtual VStatus writeInt32(int value);
  // Each reads size elements into the array, which it resizes.
  virtual VStatus readDoubleArray(VDoubleArray &array, unsigned int size);
  virtual VStatus readFloatArray(VFloatArray &array, unsigned int size);
  virtual VStatus readIntArray(VIntArray &array, unsigned int size);
  virtual VStatus readDoubleVectorArray(VVectorArray &array, unsigned int size);
  virtual VStatus readFloatVectorArray(VFloatVectorArray &array, unsigned int size);
  virtual int readInt32();

  // Whether the format keeps its own description file, which the host then
  // reads and writes through it instead of its own; false by default.
  virtual bool handlesDescription();
  virtual VStatus readDescription(VCacheFormatDescription &description,
                                  const VString &descriptionFileLocation,
                                  const VString &baseFileName);
  virtual VStatus writeDescription(const VCacheFormatDescription &description,
                                   const VString &descriptionFileLocation,
                                   const VString &baseFileName);

  static const char *className();

protected:
  // The host brackets the data of each chunk with these.
  virtual void beginWriteChunk();
  virtual void endWriteChunk();
  virtual VStatus beginReadChunk();
  virtual void endReadChunk();
};

OPENVORLA_NAMESPACE_CLOSE
