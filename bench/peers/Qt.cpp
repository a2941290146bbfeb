#include <QObject>
#include <QString>
#include <QVariant>
#include <memory>

#include "bench/Sides.h"
#include "bench/peers/PropertyNames.h"

// Properties by name and dynamic properties of a QObject.
namespace {

class Host : public QObject {
  Q_OBJECT
  Q_PROPERTY(QObject* titleLabel MEMBER label)
  Q_PROPERTY(QObject* valueLabel MEMBER label)
  Q_PROPERTY(QObject* distanceLabel MEMBER label)
  Q_PROPERTY(QObject* durationLabel MEMBER label)
  Q_PROPERTY(QObject* activeEnergyLabel MEMBER label)
  Q_PROPERTY(QObject* paceLabel MEMBER label)
  Q_PROPERTY(QObject* weatherConditionImageView MEMBER label)
  Q_PROPERTY(QObject* numberOfWorkoutsLabel MEMBER label)

 public:
  Host() : label(&shown) {}
  QObject shown;
  QObject* label;
};

auto readByName() {
  return [host = std::make_shared<Host>()] {
    for (int i = 0; i < bench::batch; ++i) {
      benchmark::DoNotOptimize(qvariant_cast<QObject*>(host->property(bench::propertyNames[i & 7])));
    }
  };
}

std::shared_ptr<Host> storing() {
  auto host = std::make_shared<Host>();
  for (const char* key : {"benchFirst", "benchSecond", "benchThird", "benchFourth"}) {
    host->setProperty(key, QVariant::fromValue<QObject*>(&host->shown));
  }
  return host;
}

auto getDynamic() {
  return [host = storing()] {
    for (int i = 0; i < bench::batch; ++i) {
      benchmark::DoNotOptimize(qvariant_cast<QObject*>(host->property("benchThird")));
    }
  };
}

auto setDynamic() {
  return [host = storing()] {
    for (int i = 0; i < bench::batch; ++i) {
      host->setProperty("benchThird", QVariant::fromValue<QObject*>(i & 1 ? &host->shown : host.get()));
    }
  };
}

const bench::RegisteredSide sides[] = {{"read text", "Qt", readByName, bench::batch},
                                       {"get", "Qt", getDynamic, bench::batch},
                                       {"set", "Qt", setDynamic, bench::batch}};

}  // namespace

#include "Qt.moc"
