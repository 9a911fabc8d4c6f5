// A test module that loads but exports no factory.
extern "C" int KernelTestNoFactoryMarker() {
  return 1;
}
