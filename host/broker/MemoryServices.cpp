// Memory of the request: what a provider does not free itself goes with its request.

#include <algorithm>
#include <cstddef>
#include <cstring>
#include <exception>
#include <limits>
#include <vector>

#include "host/broker/BrokerTables.h"
#include "host/broker/Call.h"

namespace Corvcim {
namespace {

class Block;

// Stands right before the memory that the provider sees, and is the unit that memory is counted in.
struct alignas(std::max_align_t) BlockHeader {
  Block* block;
  std::size_t size;
};

class Block : public Object {
 public:
  explicit Block(std::size_t size) : storage_(1 + size / sizeof(BlockHeader) + 1) { storage_.front() = {this, size}; }

  static Block* of(void* memory) { return (static_cast<BlockHeader*>(memory) - 1)->block; }

  [[nodiscard]] void* memory() { return storage_.data() + 1; }
  [[nodiscard]] std::size_t size() const { return storage_.front().size; }

 private:
  std::vector<BlockHeader> storage_;  // all zero after the header
};

class Mark : public Object {};

void* allocate(Broker& broker, std::size_t size) {
  try {
    return broker.currentArena().make<Block>(size)->memory();
  } catch (const std::exception&) {  // too much, or more than there is
    return nullptr;
  }
}

CMPIGcStat* mark(const CMPIBroker* handle, CMPIStatus* status) {
  Broker* broker = Broker::of(handle);
  store(status, broker != nullptr ? okStatus() : invalidHandle());
  return broker != nullptr ? broker->currentArena().make<Mark>() : nullptr;
}

// Ends everything that was made since the mark.
CMPIStatus release(const CMPIBroker* handle, const CMPIGcStat* state) {
  if (Broker::of(handle) == nullptr) {
    return invalidHandle();
  }
  if (state == nullptr) {
    return makeStatus(Broker::of(handle), CMPI_RC_ERR_INVALID_PARAMETER, "release: the mark is NULL");
  }
  auto* made = static_cast<Mark*>(const_cast<CMPIGcStat*>(state));
  made->arena().freeFrom(made);
  return okStatus();
}

void* cmpiMalloc(const CMPIBroker* handle, std::size_t size) {
  Broker* broker = Broker::of(handle);
  return broker != nullptr ? allocate(*broker, size) : nullptr;
}

void* cmpiCalloc(const CMPIBroker* handle, std::size_t count, std::size_t size) {
  if (size != 0 && count > std::numeric_limits<std::size_t>::max() / size) {
    return nullptr;
  }
  return cmpiMalloc(handle, count * size);
}

void cmpiFree(const CMPIBroker* /*handle*/, void* memory) {
  if (memory != nullptr) {
    Block* block = Block::of(memory);
    block->arena().free(block);
  }
}

void* cmpiRealloc(const CMPIBroker* handle, void* memory, std::size_t size) {
  void* const result = cmpiMalloc(handle, size);
  if (result != nullptr && memory != nullptr) {
    std::memcpy(result, memory, std::min(size, Block::of(memory)->size()));
    cmpiFree(handle, memory);
  }
  return result;
}

char* cmpiStrDup(const CMPIBroker* handle, const char* text) {
  if (text == nullptr) {
    return nullptr;
  }
  const std::size_t size = std::strlen(text) + 1;
  void* const result = cmpiMalloc(handle, size);
  if (result != nullptr) {
    std::memcpy(result, text, size);
  }
  return static_cast<char*>(result);
}

template <class T>
void freeObject(const CMPIBroker* /*handle*/, typename T::Record* record) {
  if (T* object = T::of(record)) {
    object->arena().free(object);
  }
}

// This broker makes no select expressions, so there is none to free.
void freeSelectExp(const CMPIBroker* /*handle*/, CMPISelectExp* /*expression*/) {}

}  // namespace

const CMPIBrokerMemFT memoryServices = {
    CMPI_VERSION,
    mark,
    release,
    cmpiMalloc,
    cmpiCalloc,
    cmpiRealloc,
    cmpiStrDup,
    cmpiFree,
    freeObject<InstanceObject>,
    freeObject<ObjectPathObject>,
    freeObject<ArgsObject>,
    freeObject<StringObject>,
    freeObject<ArrayObject>,
    freeObject<DateTimeObject>,
    freeSelectExp,
};

}  // namespace Corvcim
