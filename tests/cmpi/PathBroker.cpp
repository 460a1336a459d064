#include "tests/cmpi/PathBroker.h"

namespace {

void setStatus(CMPIStatus* status, CMPIrc code) {
  if (status != nullptr) {
    *status = {code, nullptr};
  }
}

}  // namespace

const CMPIStringFT PathBroker::stringTable = [] {
  CMPIStringFT table{};
  table.ftVersion = CMPI_VERSION;
  table.getCharPtr = [](const CMPIString* string, CMPIStatus* status) {
    setStatus(status, CMPI_RC_OK);
    return static_cast<const char*>(string->hdl);
  };
  return table;
}();

const CMPIDateTimeFT PathBroker::dateTimeTable = [] {
  CMPIDateTimeFT table{};
  table.ftVersion = CMPI_VERSION;
  table.getBinaryFormat = [](const CMPIDateTime* dateTime, CMPIStatus* status) {
    setStatus(status, CMPI_RC_OK);
    return of(dateTime).microseconds;
  };
  table.isInterval = [](const CMPIDateTime* dateTime, CMPIStatus* status) {
    setStatus(status, CMPI_RC_OK);
    return static_cast<CMPIBoolean>(of(dateTime).isInterval ? 1 : 0);
  };
  return table;
}();

const CMPIObjectPathFT PathBroker::pathTable = [] {
  CMPIObjectPathFT table{};
  table.ftVersion = CMPI_VERSION;
  table.getClassName = [](const CMPIObjectPath* path, CMPIStatus* status) {
    setStatus(status, CMPI_RC_OK);
    return of(path).className_;
  };
  table.getNameSpace = [](const CMPIObjectPath* path, CMPIStatus* status) {
    setStatus(status, CMPI_RC_OK);
    return of(path).nameSpace_;
  };
  table.getHostname = [](const CMPIObjectPath* path, CMPIStatus* status) {
    setStatus(status, CMPI_RC_OK);
    return of(path).host_;
  };
  table.getKeyCount = [](const CMPIObjectPath* path, CMPIStatus* status) {
    setStatus(status, of(path).failsCount_ ? CMPI_RC_ERR_FAILED : CMPI_RC_OK);
    return static_cast<CMPICount>(of(path).keys_.size());
  };
  table.getKeyAt = [](const CMPIObjectPath* path, CMPICount index, CMPIString** name, CMPIStatus* status) {
    setStatus(status, of(path).failsAt_ == index ? CMPI_RC_ERR_NO_SUCH_PROPERTY : CMPI_RC_OK);
    const Key& key = of(path).keys_.at(index);
    *name = const_cast<CMPIString*>(key.name);
    return key.data;
  };
  return table;
}();

CMPIString* PathBroker::string(std::string_view text) {
  String& made = strings_.emplace_back(String{std::string(text), {}});
  made.handle = {made.text.data(), &stringTable};
  return &made.handle;
}

CMPIDateTime* PathBroker::dateTime(CMPIUint64 microseconds, bool isInterval) {
  DateTime& made = dateTimes_.emplace_back(DateTime{microseconds, isInterval, {}});
  made.handle = {&made, &dateTimeTable};
  return &made.handle;
}

PathBroker::Path::Path(PathBroker& broker, std::string_view className)
    : broker_(broker), className_(broker.string(className)), handle_{this, &pathTable} {}

PathBroker::Path& PathBroker::Path::in(std::string_view nameSpace) {
  nameSpace_ = broker_.string(nameSpace);
  return *this;
}

PathBroker::Path& PathBroker::Path::on(std::string_view host) {
  host_ = broker_.string(host);
  return *this;
}

PathBroker::Path& PathBroker::Path::key(std::string_view name, std::string_view value) {
  return key(name, CMPI_string, {.string = broker_.string(value)});
}

PathBroker::Path& PathBroker::Path::key(std::string_view name, const Path& reference) {
  return key(name, CMPI_ref, {.ref = const_cast<CMPIObjectPath*>(&reference.handle_)});
}

PathBroker::Path& PathBroker::Path::key(std::string_view name, CMPIType type, CMPIValue value, CMPIValueState state) {
  keys_.push_back({broker_.string(name), {type, state, value}});
  return *this;
}

PathBroker::Path& PathBroker::Path::withoutClassName() {
  className_ = nullptr;
  return *this;
}

PathBroker::Path& PathBroker::Path::failingCount() {
  failsCount_ = true;
  return *this;
}

PathBroker::Path& PathBroker::Path::failingKeyAt(CMPICount index) {
  failsAt_ = index;
  return *this;
}
