#include "host/broker/Request.h"

#include "host/broker/Objects.h"

namespace Corvcim {
namespace {

// The request that the calling thread works for. A plain pointer: nothing to destroy at thread exit.
thread_local Request* currentRequest = nullptr;

}  // namespace

Arena& Broker::currentArena() {
  for (const Request* each = currentRequest; each != nullptr; each = each->previous_) {
    if (&each->broker() == this) {
      return each->arena();
    }
  }
  return *kept_;
}

Request::Request(Broker& broker, std::string_view nameSpace)
    : broker_(broker), previous_(currentRequest), arena_(std::make_unique<Arena>(broker)) {
  // By these names providers find the flags of the request and its namespace.
  context_ = arena_
                 ->make<ContextObject>(this, std::vector<NamedValue>{{"CMPIInvocationFlags", Value::uint32(0)},
                                                                     {"CMPIInitNameSpace", Value::string(nameSpace)}})
                 ->record();
  result_ = arena_->make<ResultObject>()->record();
  currentRequest = this;
}

Request::~Request() {
  currentRequest = previous_;
}

bool Request::attach(Request* request) {
  if (request == nullptr || currentRequest != nullptr) {
    return false;
  }
  currentRequest = request;
  return true;
}

void Request::detach() {
  currentRequest = nullptr;
}

CMPIObjectPath* Request::objectPath(const ObjectPath& path) {
  return arena_->make<ObjectPathObject>(path)->record();
}

CMPIInstance* Request::instance(const Instance& instance) {
  return arena_->make<InstanceObject>(instance)->record();
}

CMPIString* Request::string(std::string_view text) {
  return arena_->make<StringObject>(std::string(text))->record();
}

const char** Request::propertyList(const PropertyList& properties) {
  if (!properties) {
    return nullptr;
  }
  auto& texts = *listTexts_.emplace_back(std::make_unique<std::vector<std::string>>(*properties));
  auto& list = *lists_.emplace_back(std::make_unique<std::vector<const char*>>());
  for (const std::string& each : texts) {
    list.push_back(each.c_str());
  }
  list.push_back(nullptr);
  return list.data();
}

Response Request::response(const CMPIStatus& status) const {
  Response result = ResultObject::of(result_)->response;
  result.rc = status.rc;
  if (const StringObject* message = StringObject::of(status.msg)) {
    result.message = message->text;
  }
  return result;
}

ObjectPath valueOf(const CMPIObjectPath* path) {
  const ObjectPathObject* object = ObjectPathObject::of(path);
  return object != nullptr ? object->path : ObjectPath{};
}

Instance valueOf(const CMPIInstance* instance) {
  const InstanceObject* object = InstanceObject::of(instance);
  return object != nullptr ? object->complete() : Instance{};
}

std::string textOf(const CMPIString* string) {
  const StringObject* object = StringObject::of(string);
  return object != nullptr ? object->text : std::string{};
}

}  // namespace Corvcim
