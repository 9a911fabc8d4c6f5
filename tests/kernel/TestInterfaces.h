// Interfaces and classes shared by the kernel tests and their test modules.
#pragma once

#include "VORExtension.h"
#include "VORHandle.h"

class ITestShape : public virtual VORBaseUnknown {
  VOR_DECLARE_INTERFACE(ITestShape)
 public:
  virtual int Corners() const = 0;
};
VOR_DECLARE_HANDLE(ITestShape);

class ITestColour : public virtual VORBaseUnknown {
  VOR_DECLARE_INTERFACE(ITestColour)
 public:
  virtual int Colour() const = 0;
  virtual void SetColour(int colour) = 0;
};
VOR_DECLARE_HANDLE(ITestColour);

class ITestLabel : public virtual VORBaseUnknown {
  VOR_DECLARE_INTERFACE(ITestLabel)
 public:
  virtual const char* Label() const = 0;
};
VOR_DECLARE_HANDLE(ITestLabel);

// Provided only by the good test module, through the module dictionary.
class ITestModuleProvided : public virtual VORBaseUnknown {
  VOR_DECLARE_INTERFACE(ITestModuleProvided)
 public:
  virtual int Answer() const = 0;
};
VOR_DECLARE_HANDLE(ITestModuleProvided);
