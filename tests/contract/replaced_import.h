// A function of Windows that behaves as on another machine.
#pragma once

namespace contract {

// While it lives, this program's own calls of an imported function go to another one. `import` is the place of its
// address, which the linker calls "__imp_" and the function's name.
class ReplacedImport {
 public:
  template <typename F>
  ReplacedImport(void*& import, F* function) : import_(import), before_(import) {
    Set(reinterpret_cast<void*>(function));
  }
  ~ReplacedImport() { Set(before_); }
  ReplacedImport(const ReplacedImport&) = delete;
  ReplacedImport& operator=(const ReplacedImport&) = delete;

 private:
  void Set(void* function);

  void*& import_;
  void* const before_;
};

}  // namespace contract
