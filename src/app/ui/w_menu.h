#pragma once

#include "app/estado.h"
#include "app/ui/catalogo_janelas.h"
#include "common/ui/mensagens_janela.h"
#include "devices/linha_serie.h"
#include "pos/cozinha/polling_cozinha.h"

#include <QDialog>
#include <QLabel>
#include <QMainWindow>
#include <QMdiArea>
#include <QTimer>

namespace brasel::app {

// Every window the main window opens, for the rights (the full set of a new user's rights is
// made from it).
CatalogoJanelas catalogoPrograma(Estado& estado, MessagePort& mensagens,
                                 devices::LinhaSerie& linha);

// The main window: the frame every working window opens in, with its menu, status bar,
// background picture and timers. Closing it (or logging off) ends the user's work and asks to
// go back to the login.
class WMenu : public QMainWindow {
    Q_OBJECT
  public:
    explicit WMenu(Estado& estado, QWidget* pai = nullptr);

    // The load sequence; false when the company is not configured and the program must end.
    bool carregar();

    QMdiArea* area() const { return area_; }
    // The workstation's one serial control: ticket printer, customer display and drawer.
    devices::LinhaSerie& linhaSerie() { return linha_; }
    const CatalogoJanelas& catalogo() const { return catalogo_; }
    // Shows a window inside the frame after its access check; false (and the window deleted)
    // when refused.
    bool abrirJanela(QWidget* janela, const QString& caption);
    // The same for a dialog, shown modally.
    bool abrirDialogo(QDialog* dialogo, const QString& caption);

  Q_SIGNALS:
    // The main window closed: the user's work ended, the login comes back.
    void terminou();

  protected:
    void closeEvent(QCloseEvent* evento) override;

  private:
    void criarMenu();
    void actualizaBarraEstado();
    void verificaVersao();
    void aplicaFundo();
    void acercaDe();
    void configurarImpressora();
    void abrirFacturacao();
    void configurar();
    void editarAcessos();
    void mudarUtilizador();
    // The user's colour and the entries only some users may use.
    void aplicaUtilizador();
    void abrirGaveta();
    void programaCozinha();

    Estado& estado_;
    MensagensJanela mensagens_;
    QMdiArea* area_;
    QList<QLabel*> paineis_;
    devices::LinhaSerie linha_;
    pos::cozinha::PollingCozinha cozinha_;
    CatalogoJanelas catalogo_;
    QTimer relogio_;
    QTimer versao_;
    QTimer pedidos_;
    bool terminado_ = false;
};

}  // namespace brasel::app
