#include "mainwindow/Form1.h"
#include "platform/events.h"

int main() {
  Form1 JanelaPrincipal;
  if (!JanelaPrincipal.Form_Load()) return 0;
  JanelaPrincipal.Show();
  platform::RunEventLoop();
  return 0;
}
