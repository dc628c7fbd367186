#pragma once

#include "app/config_cfg.h"
#include "app/estado.h"
#include "servidor_dispositivo.h"

#include <QString>
#include <QTemporaryDir>

#include <map>
#include <memory>

namespace brasel::testing {

// Simulated devices on pseudo-terminals for one test. Each device plays as a port "COM n":
// a stable link in the test's folder points at its terminal, a COM map file of the test's own
// names the links of COM1 to COM16 (a port with no device is a path that does not exist), and a
// Config.cfg names that map in its fourth line.
//
//   DevsimTeste devsim;
//   auto& impressora = devsim.liga(1, std::make_shared<devsim::ImpressoraTalao>(codigos));
//   devices::LinhaSerie linha(devsim.mapa());        // or devsim.aplica(estado)
//   ... print ...; impressora.espera(...), impressora.transcricao()
//
// Unplugging: liga(n).parar() closes the terminal and removes the link (an open port gets write
// errors, a new open finds nothing); liga(n).iniciar() plugs it in again on the same link.
class DevsimTeste {
  public:
    DevsimTeste();
    ~DevsimTeste();
    DevsimTeste(const DevsimTeste&) = delete;
    DevsimTeste& operator=(const DevsimTeste&) = delete;

    // Plays `dispositivo` as COM `porta` (replacing a device already there).
    devsim::ServidorDispositivo& liga(int porta, std::shared_ptr<devsim::Dispositivo> dispositivo);
    devsim::ServidorDispositivo& servidor(int porta) { return *servidores_.at(porta); }

    // The stable path of COM `porta` (a link to its terminal while the device plays).
    QString caminho(int porta) const;
    QString ficheiroMapa() const;
    app::MapaPortas mapa() const { return app::MapaPortas::ler(ficheiroMapa()); }
    // A complete Config.cfg whose port map is ficheiroMapa().
    QString configCfg() const;
    // Points the state's Config.cfg port map at ficheiroMapa().
    void aplica(app::Estado& estado) const { estado.config.mapaPortas = ficheiroMapa(); }
    QString pasta() const { return pasta_.path(); }

  private:
    void escreveMapa() const;

    QTemporaryDir pasta_;
    std::map<int, std::unique_ptr<devsim::ServidorDispositivo>> servidores_;
};

}  // namespace brasel::testing
