#pragma once

#include <QByteArray>
#include <QString>

#include <functional>

namespace devsim {

// A device played on one pseudo-terminal: it receives every byte the program writes to the
// port, may answer through `responder`, and keeps a readable transcript of what it understood.
class Dispositivo {
  public:
    using Responder = std::function<void(const QByteArray&)>;

    virtual ~Dispositivo() = default;
    // Bytes arrived from the program (in whatever pieces the line delivered them).
    virtual void recebe(const QByteArray& bytes) = 0;
    // What the device has shown, printed or answered so far, as text for a person or a test.
    virtual QString transcricao() const = 0;

    void defineResponder(Responder responder) { responder_ = std::move(responder); }

  protected:
    void responde(const QByteArray& bytes) const {
        if (responder_) responder_(bytes);
    }

  private:
    Responder responder_;
};

}  // namespace devsim
