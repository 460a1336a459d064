// Memory of the request: what a provider does not free itself goes with its request.

#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <cstring>
#include <limits>

#include "host/broker/BrokerTables.h"
#include "host/broker/Call.h"

namespace Corvcim {
namespace {

class Block;

// Stands right before the memory that the provider sees.
struct alignas(std::max_align_t) BlockHeader {
  Block* block;
  std::size_t size;
};

class Block : public Object {
 public:
  explicit Block(std::size_t size) : header_(static_cast<BlockHeader*>(std::calloc(1, sizeof(BlockHeader) + size))) {
    if (header_ != nullptr) {
      *header_ = {this, size};
    }
  }
  ~Block() override { std::free(header_); }

  static Block* of(void* memory) { return (static_cast<BlockHeader*>(memory) - 1)->block; }

  [[nodiscard]] void* memory() const { return header_ != nullptr ? header_ + 1 : nullptr; }
  [[nodiscard]] std::size_t size() const { return header_->size; }

 private:
  BlockHeader* header_;
};

class Mark : public Object {};

void* allocate(Broker& broker, std::size_t size) {
  if (size > static_cast<std::size_t>(std::numeric_limits<std::ptrdiff_t>::max()) - sizeof(BlockHeader)) {
    return nullptr;
  }
  Arena& arena = broker.currentArena();
  Block* block = arena.make<Block>(size);
  if (block->memory() == nullptr) {
    arena.free(block);
    return nullptr;
  }
  return block->memory();
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
