#pragma once

#include "app/acessos.h"
#include "app/editor_acessos.h"
#include "common/message_port.h"

#include <QComboBox>
#include <QDialog>
#include <QList>
#include <QTreeWidget>

#include <functional>

namespace brasel::app {

// Where each item of the tree keeps the key of its right.
inline constexpr int kPapelChave = Qt::UserRole + 1;

// The rights editor: a user's rights as a tree (the program, its windows, their buttons), each
// switched on or off, saved together.
class frmAcessos : public QDialog {
    Q_OBJECT
  public:
    // `janelas` gives the windows the main window registers, for a user who has no rights yet.
    frmAcessos(Estado& estado, MessagePort& mensagens, std::function<QList<JanelaAcesso>()> janelas,
               QWidget* pai = nullptr);

    // The user whose rights are edited; their tree is read at once.
    void Utilizador(const QString& codigo);
    void ShowForm();

    QTreeWidget* tvwAcessos() const { return arvore_; }
    // The rights as the tree shows them now.
    QList<DireitoAcesso> direitosMarcados() const;

  private:
    void carrega();
    bool criarRegisto();
    void marcaTodos(bool ligado);
    void grava();

    Estado& estado_;
    MessagePort& mensagens_;
    std::function<QList<JanelaAcesso>()> janelas_;
    QComboBox* cmbUtilizador_;
    QTreeWidget* arvore_;
    QString utilizador_;
    QList<DireitoAcesso> direitos_;
    QList<QTreeWidgetItem*> itens_;  // one per right, in the same order
};

}  // namespace brasel::app
