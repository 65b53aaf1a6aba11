<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="pt_BR">
<context>
    <name>CalibrationNeededPopup</name>
    <message>
        <source>Calibration Required</source>
        <translation>Calibração necessária</translation>
    </message>
    <message>
        <source>New measurements cannot be made until the instrument is calibrated. Press Calibrate to start the calibration sequence.</source>
        <translation>Não é possível fazer novas medições até o instrumento ser calibrado. Pressione Calibrar para iniciar a calibração.</translation>
    </message>
    <message>
        <source>Ignore</source>
        <translation>Ignorar</translation>
    </message>
    <message>
        <source>Calibrate</source>
        <translation>Calibrar</translation>
    </message>
    <message>
        <source>Calibration needed within %1 %2</source>
        <translation>Calibração necessária em %1 %2</translation>
    </message>
    <message>
        <source>seconds</source>
        <translation>segundos</translation>
    </message>
    <message>
        <source>minutes</source>
        <translation>minutos</translation>
    </message>
    <message>
        <source>hours</source>
        <translation>horas</translation>
    </message>
    <message>
        <source>days</source>
        <translation>dias</translation>
    </message>
</context>
<context>
    <name>CalibrationPopup</name>
    <message>
        <source>Calibration Starting</source>
        <translation>Iniciando calibração</translation>
    </message>
    <message>
        <source>Calibrating</source>
        <translation>Calibrando</translation>
    </message>
    <message>
        <source>Do not touch or bump instrument</source>
        <translation>Não toque nem bata no instrumento</translation>
    </message>
    <message>
        <source>Calculating</source>
        <translation>A calcular</translation>
    </message>
    <message>
        <source>Complete</source>
        <translation>Concluído</translation>
    </message>
    <message>
        <source>OK to move instrument</source>
        <translation>Pode mover o instrumento</translation>
    </message>
</context>
<context>
    <name>CalibrationReferenceCheckPopup</name>
    <message>
        <source>Measurement Starting</source>
        <translation>Iniciando medição</translation>
    </message>
    <message>
        <source>Measuring</source>
        <translation>A medir</translation>
    </message>
</context>
<context>
    <name>CalibrationSensorPopup</name>
    <message>
        <source>Not all pressure sensors are active. Press the OK button to start the calibration when all pressure sensors are active</source>
        <translation>Nem todos os sensores de pressão estão ativos. Pressione OK para iniciar a calibração quando todos estiverem ativos</translation>
    </message>
    <message>
        <source>Incorrect Position</source>
        <translation>Posição incorreta</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>OK</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Cancelar</translation>
    </message>
</context>
<context>
    <name>CalibrationStep2PageContents</name>
    <message>
        <source>PLACE ON A FLAT SURFACE</source>
        <translation>COLOCAR EM SUPERFÍCIE PLANA</translation>
    </message>
    <message>
        <source>ALIGN WHITE LINE</source>
        <translation>ALINHAR A LINHA BRANCA</translation>
    </message>
</context>
<context>
    <name>CalibrationStep3PageContents</name>
    <message>
        <source>Tap the calibrate button to start calibration</source>
        <translation>Toque no botão Calibrar para iniciar a calibração</translation>
    </message>
    <message>
        <source>Calibrate</source>
        <translation>Calibrar</translation>
    </message>
    <message>
        <source>or</source>
        <translation>ou</translation>
    </message>
    <message>
        <source>Press the measurement button on the instrument</source>
        <translation>Pressione o botão de medição do instrumento</translation>
    </message>
</context>
<context>
    <name>CalibrationWizardPage</name>
    <message>
        <source>Step 1</source>
        <translation>Passo 1</translation>
    </message>
    <message>
        <source>Step %1</source>
        <translation>Passo %1</translation>
    </message>
</context>
<context>
    <name>CalibrationWizardPageContainer</name>
    <message>
        <source>Tap the self test button to start self testing</source>
        <translation>Toque no botão Autoteste para iniciar o autoteste</translation>
    </message>
    <message>
        <source>Self Test</source>
        <translation>Autoteste</translation>
    </message>
    <message>
        <source>Calibrate your instrument by using the white reference tile included with your instrument.</source>
        <translation>Calibre o seu instrumento com o padrão branco fornecido com o instrumento.</translation>
    </message>
    <message>
        <source>Serial Number: %1</source>
        <translation>Número de série: %1</translation>
    </message>
    <message>
        <source>Place the instrument on the white calibration tile by aligning the white line on the desired reference.</source>
        <translation>Coloque o instrumento sobre o padrão branco alinhando a linha branca com a referência pretendida.</translation>
    </message>
    <message>
        <source>Verify your instrument by using the effect reference tile included with your instrument. Serial Number: %1</source>
        <translation>Verifique o seu instrumento com a placa de referência de efeito fornecida com o instrumento. Número de série: %1</translation>
    </message>
    <message>
        <source>Place the instrument on the effect reference tile by aligning the white line on the desired reference</source>
        <translation>Coloque o instrumento sobre a placa de referência de efeito alinhando a linha branca com a referência pretendida</translation>
    </message>
    <message>
        <source>Self test your instrument by using the white reference tile included with your instrument. Serial Number: %1</source>
        <translation>Faça o autoteste do instrumento com o padrão branco fornecido. Número de série: %1</translation>
    </message>
    <message>
        <source>Place the instrument on the white reference tile by aligning the white line on the desired reference</source>
        <translation>Coloque o instrumento sobre o padrão branco alinhando a linha branca com a referência pretendida</translation>
    </message>
    <message>
        <source>Self test your instrument by using the effect reference tile included with your instrument. Serial Number: %1</source>
        <translation>Faça o autoteste do instrumento com a placa de referência de efeito fornecida. Número de série: %1</translation>
    </message>
    <message>
        <source>Self test your instrument by lifting the instrument into open air (not placed on anything)</source>
        <translation>Faça o autoteste levantando o instrumento no ar (sem o apoiar em nada)</translation>
    </message>
</context>
<context>
    <name>CalibrationWizardScreen</name>
    <message>
        <source>Calibration</source>
        <translation>Calibração</translation>
    </message>
    <message>
        <source>Self Test %1: %2</source>
        <translation>Autoteste %1: %2</translation>
    </message>
    <message>
        <source>Reference Tile Check</source>
        <translation>Verificação da placa de referência</translation>
    </message>
</context>
<context>
    <name>DaddyPanel</name>
    <message>
        <source>Warning</source>
        <translation>Aviso</translation>
    </message>
    <message>
        <source>Reference Check Failed</source>
        <translation>Falha na verificação de referência</translation>
    </message>
    <message>
        <source>Instrument Is Full</source>
        <translation>Memória do instrumento cheia</translation>
    </message>
    <message>
        <source>There is not enough memory to complete the requested Job. Please remove existing jobs to free up memory.</source>
        <translation>Memória insuficiente para concluir o trabalho. Elimine trabalhos existentes para libertar memória.</translation>
    </message>
    <message>
        <source>Error</source>
        <translation>Erro</translation>
    </message>
    <message>
        <source>No database entries</source>
        <translation>Sem entradas na base de dados</translation>
    </message>
    <message>
        <source>Measurement Cancelled</source>
        <translation>Medição cancelada</translation>
    </message>
    <message>
        <source>The instrument was moved during a measurement</source>
        <translation>O instrumento foi movido durante a medição</translation>
    </message>
    <message>
        <source>Index invalid</source>
        <translation>Índice inválido</translation>
    </message>
    <message>
        <source>Calibration Error</source>
        <translation>Erro de calibração</translation>
    </message>
    <message>
        <source>Instrument not on white tile, or internal white dirty</source>
        <translation>Instrumento fora do padrão branco, ou branco interno sujo</translation>
    </message>
    <message>
        <source>Calibration data not valid</source>
        <translation>Dados de calibração inválidos</translation>
    </message>
    <message>
        <source>Not calibrated</source>
        <translation>Não calibrado</translation>
    </message>
    <message>
        <source>External white tile too dirty or incorrect white tile</source>
        <translation>Padrão branco externo demasiado sujo ou incorreto</translation>
    </message>
    <message>
        <source>Measurement Aborted</source>
        <translation>Medição interrompida</translation>
    </message>
    <message>
        <source>The measurement has been aborted by the user</source>
        <translation>A medição foi interrompida pelo utilizador</translation>
    </message>
    <message>
        <source>Battery is low. Charge the battery</source>
        <translation>Bateria fraca. Carregue a bateria</translation>
    </message>
    <message>
        <source>Battery is empty. Instrument will shut down</source>
        <translation>Bateria esgotada. O instrumento vai desligar-se</translation>
    </message>
    <message>
        <source>Error in shutter motor</source>
        <translation>Erro no motor do obturador</translation>
    </message>
    <message>
        <source>No stored reference measurement</source>
        <translation>Sem medição de referência guardada</translation>
    </message>
    <message>
        <source>Spectral integration time on white too long</source>
        <translation>Tempo de integração espetral no branco demasiado longo</translation>
    </message>
    <message>
        <source>Wavelength shift above absolute limit of 5 nm</source>
        <translation>Desvio de comprimento de onda acima do limite absoluto de 5 nm</translation>
    </message>
    <message>
        <source>Low Storage</source>
        <translation>Pouco armazenamento</translation>
    </message>
    <message>
        <source>Problem occurred changing Wi-Fi modes</source>
        <translation>Problema ao mudar o modo Wi-Fi</translation>
    </message>
    <message>
        <source>Problem occurred scanning for Wi-Fi</source>
        <translation>Problema ao procurar redes Wi-Fi</translation>
    </message>
    <message>
        <source>Sample temperature too high (IR Sensor)</source>
        <translation>Temperatura da amostra demasiado alta (sensor IV)</translation>
    </message>
    <message>
        <source>Sample temperature too low (IR Sensor)</source>
        <translation>Temperatura da amostra demasiado baixa (sensor IV)</translation>
    </message>
    <message>
        <source>Battery level is too low for update</source>
        <translation>Nível de bateria demasiado baixo para atualizar</translation>
    </message>
    <message>
        <source>Date and time not set</source>
        <translation>Data e hora não definidas</translation>
    </message>
    <message>
        <source>Problem during initialization. Please reboot the device</source>
        <translation>Problema durante a inicialização. Reinicie o dispositivo</translation>
    </message>
    <message>
        <source>Hardware communication error. Please reboot the device</source>
        <translation>Erro de comunicação do hardware. Reinicie o dispositivo</translation>
    </message>
    <message>
        <source>Error during measurement</source>
        <translation>Erro durante a medição</translation>
    </message>
    <message>
        <source>Different best matches for checkpoints</source>
        <translation>Melhores correspondências diferentes nos pontos de controlo</translation>
    </message>
    <message>
        <source>Calibrating</source>
        <translation>A calibrar</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>OK</translation>
    </message>
</context>
<context>
    <name>DeleteAllSamplesPopup</name>
    <message>
        <source>Clear Database</source>
        <translation>Limpar banco de dados</translation>
    </message>
    <message>
        <source>Are you sure you want to clear the database, this will delete all samples and jobs from the instrument?</source>
        <translation>Tem certeza de que deseja limpar o banco de dados? Todas as amostras e trabalhos do instrumento serão excluídos.</translation>
    </message>
</context>
<context>
    <name>DeletePopup</name>
    <message>
        <source>Delete All Samples?</source>
        <translation>Eliminar todas as amostras?</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Eliminar</translation>
    </message>
    <message>
        <source>No</source>
        <translation>Não</translation>
    </message>
</context>
<context>
    <name>DeleteSamplePopup</name>
    <message>
        <source>Delete Sample?</source>
        <translation>Excluir amostra?</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Excluir</translation>
    </message>
    <message>
        <source>No</source>
        <translation>Não</translation>
    </message>
</context>
<context>
    <name>ImageViewScreen</name>
    <message>
        <source>Camera Images</source>
        <translation>Imagens da câmera</translation>
    </message>
</context>
<context>
    <name>JobActionsPopup</name>
    <message>
        <source>Delete Job</source>
        <translation>Eliminar trabalho</translation>
    </message>
    <message>
        <source>View/Edit Job</source>
        <translation>Ver/editar trabalho</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Cancelar</translation>
    </message>
    <message>
        <source>Copy Job</source>
        <translation>Copiar trabalho</translation>
    </message>
    <message>
        <source>Send Job To Server</source>
        <translation>Enviar trabalho para o servidor</translation>
    </message>
    <message>
        <source>Execute Job</source>
        <translation>Executar trabalho</translation>
    </message>
</context>
<context>
    <name>JobFreeTextEditScreen</name>
    <message>
        <source>Notes</source>
        <translation>Notas</translation>
    </message>
</context>
<context>
    <name>JobKeypadScreen</name>
    <message>
        <source>OK</source>
        <translation>OK</translation>
    </message>
    <message>
        <source>ABC</source>
        <translation>ABC</translation>
    </message>
    <message>
        <source>Special Keys</source>
        <translation>Símbolos</translation>
    </message>
</context>
<context>
    <name>JobListQuickSelectionItem</name>
    <message>
        <source>Delete All Completed Jobs</source>
        <translation>Eliminar todos os trabalhos concluídos</translation>
    </message>
</context>
<context>
    <name>JobListScreen</name>
    <message>
        <source>Jobs</source>
        <translation>Trabalhos</translation>
    </message>
    <message>
        <source>+</source>
        <translation>+</translation>
    </message>
    <message>
        <source>Open</source>
        <translation>Abertos</translation>
    </message>
    <message>
        <source>Complete</source>
        <translation>Concluídos</translation>
    </message>
    <message>
        <source>Open (%1)</source>
        <translation>Abertos (%1)</translation>
    </message>
    <message>
        <source>Complete (%1)</source>
        <translation>Concluídos (%1)</translation>
    </message>
    <message>
        <source>Delete Job?</source>
        <translation>Eliminar trabalho?</translation>
    </message>
    <message>
        <source>The entire job and all samples will be permanently deleted.</source>
        <translation>O trabalho completo e todas as amostras serão eliminados permanentemente.</translation>
    </message>
    <message>
        <source>Delete All Completed Jobs?</source>
        <translation>Eliminar todos os trabalhos concluídos?</translation>
    </message>
    <message>
        <source>All completed jobs will be permanently deleted.</source>
        <translation>Todos os trabalhos concluídos serão eliminados permanentemente.</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>OK</translation>
    </message>
    <message>
        <source>Instrument Is Full</source>
        <translation>Memória do instrumento cheia</translation>
    </message>
    <message>
        <source>A new job cannot be created until one or more existing jobs are removed from the instrument.</source>
        <translation>Não é possível criar um novo trabalho até eliminar um ou mais trabalhos do instrumento.</translation>
    </message>
    <message>
        <source>There is not enough memory to complete the requested Job. Please remove existing jobs to free up memory.</source>
        <translation>Memória insuficiente para concluir o trabalho. Elimine trabalhos existentes para libertar memória.</translation>
    </message>
</context>
<context>
    <name>JobMeasureScreen</name>
    <message>
        <source>Summary</source>
        <translation>Resumo</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Eliminar</translation>
    </message>
    <message>
        <source>Measure</source>
        <translation>Medir</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>Guardar</translation>
    </message>
    <message>
        <source>Job Details</source>
        <translation>Detalhes do trabalho</translation>
    </message>
    <message>
        <source>Name:</source>
        <translation>Nome:</translation>
    </message>
    <message>
        <source>%1:</source>
        <translation>%1:</translation>
    </message>
    <message>
        <source>Notes:</source>
        <translation>Notas:</translation>
    </message>
    <message>
        <source>Send Job To Server</source>
        <translation>Enviar trabalho para o servidor</translation>
    </message>
    <message>
        <source>SMC Results</source>
        <translation>Resultado SMC</translation>
    </message>
    <message>
        <source>Average Results</source>
        <translation>Resultado médio</translation>
    </message>
    <message>
        <source>Measurements</source>
        <translation>Medições</translation>
    </message>
    <message>
        <source>%1 of %2 completed</source>
        <translation>%1 de %2 concluídas</translation>
    </message>
    <message>
        <source>Delete Job?</source>
        <translation>Eliminar trabalho?</translation>
    </message>
    <message>
        <source>The entire job and all samples will be permanently deleted.</source>
        <translation>O trabalho completo e todas as amostras serão eliminados permanentemente.</translation>
    </message>
    <message>
        <source>Warning</source>
        <translation>Aviso</translation>
    </message>
    <message>
        <source>This job was not created on the instrument. Are you sure you want to edit the job?</source>
        <translation>Este trabalho não foi criado no instrumento. Tem a certeza de que pretende editá-lo?</translation>
    </message>
    <message>
        <source>Edit</source>
        <translation>Editar</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Cancelar</translation>
    </message>
</context>
<context>
    <name>JobNameEditScreen</name>
    <message>
        <source>Name</source>
        <translation>Nome</translation>
    </message>
    <message>
        <source>Job Name cannot be empty</source>
        <translation>O nome do trabalho não pode estar vazio</translation>
    </message>
    <message>
        <source>Enter a unique job name that is not empty</source>
        <translation>Introduza um nome de trabalho único e não vazio</translation>
    </message>
    <message>
        <source>Job Name Already Exists</source>
        <translation>O nome do trabalho já existe</translation>
    </message>
    <message>
        <source>This job name already exists.  Please change the name to a unique name</source>
        <translation>Este nome de trabalho já existe. Altere-o para um nome único</translation>
    </message>
</context>
<context>
    <name>JobTagEditScreen</name>
    <message>
        <source>Tag Name Does Not Exist</source>
        <translation>A etiqueta não existe</translation>
    </message>
    <message>
        <source>This tag name does not exist. Please change the name to an existing tag name</source>
        <translation>Esta etiqueta não existe. Escolha uma etiqueta existente</translation>
    </message>
</context>
<context>
    <name>Keypad</name>
    <message>
        <source>123</source>
        <translation>123</translation>
    </message>
    <message>
        <source>ABC</source>
        <translation>ABC</translation>
    </message>
</context>
<context>
    <name>LockScreen</name>
    <message>
        <source>Instrument Locked</source>
        <translation>Instrumento bloqueado</translation>
    </message>
</context>
<context>
    <name>MeasuringPopup</name>
    <message>
        <source>Measuring</source>
        <translation>A medir</translation>
    </message>
    <message>
        <source>Hold Steady</source>
        <translation>Mantenha firme</translation>
    </message>
    <message>
        <source>Do not touch or bump instrument</source>
        <translation>Não toque nem bata no instrumento</translation>
    </message>
    <message>
        <source>Calculating</source>
        <translation>A calcular</translation>
    </message>
    <message>
        <source>OK to move instrument</source>
        <translation>Pode mover o instrumento</translation>
    </message>
</context>
<context>
    <name>PowerDownPopup</name>
    <message>
        <source>Power Off</source>
        <translation>Desligar</translation>
    </message>
    <message>
        <source>Reboot</source>
        <translation>Reiniciar</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Cancelar</translation>
    </message>
</context>
<context>
    <name>RestoreFactorySettingsPopup</name>
    <message>
        <source>Confirm by moving the dot around the circle</source>
        <translation>Confirme girando o ponto ao redor do círculo</translation>
    </message>
    <message>
        <source>Restore Factory Settings</source>
        <translation>Restaurar configurações de fábrica</translation>
    </message>
    <message>
        <source>All current user settings will go back to defaults. Any jobs or samples will also be lost!</source>
        <translation>Todas as configurações voltarão ao padrão. Os trabalhos e as amostras também serão perdidos!</translation>
    </message>
</context>
<context>
    <name>SadPuppyScreen</name>
    <message>
        <source>Error</source>
        <translation>Erro</translation>
    </message>
    <message>
        <source>An error has occurred, please reboot the instrument</source>
        <translation>Ocorreu um erro. Reinicie o instrumento</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>OK</translation>
    </message>
</context>
<context>
    <name>SampleDetailsViewer</name>
    <message>
        <source>Color View</source>
        <translation>Visualização de cor</translation>
    </message>
</context>
<context>
    <name>SampleDetailsViewerD15</name>
    <message>
        <source>15%1 Series</source>
        <translation>Série 15%1</translation>
    </message>
</context>
<context>
    <name>SampleDetailsViewerD45</name>
    <message>
        <source>45%1 Series</source>
        <translation>Série 45%1</translation>
    </message>
</context>
<context>
    <name>SampleDetailsViewerTexture</name>
    <message>
        <source>15%1 Texture</source>
        <translation>Textura 15%1</translation>
    </message>
</context>
<context>
    <name>SampleListSelectionItemComplete</name>
    <message>
        <source>More measurements are needed to complete this job</source>
        <translation>São necessárias mais medições para concluir este trabalho</translation>
    </message>
</context>
<context>
    <name>SampleResultsPage</name>
    <message>
        <source>Measurement</source>
        <translation>Medição</translation>
    </message>
    <message>
        <source>Camera Images</source>
        <translation>Imagens da câmera</translation>
    </message>
</context>
<context>
    <name>SampleViewScreen</name>
    <message>
        <source>Details</source>
        <translation>Detalhes</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Excluir</translation>
    </message>
</context>
<context>
    <name>SelfTestListItem</name>
    <message>
        <source>Pass</source>
        <translation>Aprovado</translation>
    </message>
    <message>
        <source>Fail</source>
        <translation>Reprovado</translation>
    </message>
    <message>
        <source>Canceled</source>
        <translation>Cancelado</translation>
    </message>
    <message>
        <source>Error</source>
        <translation>Erro</translation>
    </message>
</context>
<context>
    <name>SelfTestPopup</name>
    <message>
        <source>Hold the instrument in open air</source>
        <translation>Mantenha o instrumento no ar</translation>
    </message>
    <message>
        <source>Do not touch or bump instrument</source>
        <translation>Não toque nem bata no instrumento</translation>
    </message>
    <message>
        <source>Complete</source>
        <translation>Concluído</translation>
    </message>
</context>
<context>
    <name>SelfTestScreen</name>
    <message>
        <source>Self Test</source>
        <translation>Autoteste</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>OK</translation>
    </message>
    <message>
        <source>White Calibration</source>
        <translation>Calibração do branco</translation>
    </message>
    <message>
        <source>Reference check on white</source>
        <translation>Verificação de referência no branco</translation>
    </message>
    <message>
        <source>Effect tile test</source>
        <translation>Teste da placa de efeito</translation>
    </message>
    <message>
        <source>Repeatability tests</source>
        <translation>Testes de repetibilidade</translation>
    </message>
    <message>
        <source>Temperature tests</source>
        <translation>Testes de temperatura</translation>
    </message>
    <message>
        <source>Pressure sensor test</source>
        <translation>Teste dos sensores de pressão</translation>
    </message>
    <message>
        <source>Check error logs</source>
        <translation>Verificar registros de erros</translation>
    </message>
    <message>
        <source>Testing...</source>
        <translation>Testando...</translation>
    </message>
    <message>
        <source>All Tests Complete</source>
        <translation>Todos os testes concluídos</translation>
    </message>
    <message>
        <source>Self Tests Canceled</source>
        <translation>Autotestes cancelados</translation>
    </message>
</context>
<context>
    <name>SettingsDatabaseMemoryPage</name>
    <message>
        <source>Database / Memory</source>
        <translation>Banco de dados / memória</translation>
    </message>
    <message>
        <source>Samples</source>
        <translation>Amostras</translation>
    </message>
    <message>
        <source>Jobs</source>
        <translation>Trabalhos</translation>
    </message>
    <message>
        <source>Clear Database</source>
        <translation>Limpar banco de dados</translation>
    </message>
</context>
<context>
    <name>SettingsDirectoryExplorerPage</name>
    <message>
        <source>No files</source>
        <translation>Nenhum arquivo</translation>
    </message>
</context>
<context>
    <name>SettingsDisplayPage</name>
    <message>
        <source>Display Settings</source>
        <translation>Tela</translation>
    </message>
    <message>
        <source>Display Brightness</source>
        <translation>Brilho da tela</translation>
    </message>
</context>
<context>
    <name>SettingsFileViewerPage</name>
    <message>
        <source>The file can&apos;t be shown.</source>
        <translation>Não é possível mostrar o arquivo.</translation>
    </message>
    <message>
        <source>The file can&apos;t be read.</source>
        <translation>Não é possível ler o arquivo.</translation>
    </message>
</context>
<context>
    <name>SettingsLanguagePage</name>
    <message>
        <source>Language</source>
        <translation>Idioma</translation>
    </message>
</context>
<context>
    <name>SettingsLegalInformationPage</name>
    <message>
        <source>Legal Information</source>
        <translation>Informações legais</translation>
    </message>
</context>
<context>
    <name>SettingsListSelectionPowerInfo</name>
    <message>
        <source>%1 hour </source>
        <translation>%1 hora </translation>
    </message>
    <message>
        <source>%1 hours </source>
        <translation>%1 horas </translation>
    </message>
    <message>
        <source>%1 minutes and </source>
        <translation>%1 minutos e </translation>
    </message>
    <message>
        <source>%1 seconds</source>
        <translation>%1 segundos</translation>
    </message>
    <message>
        <source>Never</source>
        <translation>Nunca</translation>
    </message>
    <message>
        <source>Display dims after: %1
Standby after: %2
Power off after: %3</source>
        <translation>Escurecer após: %1
Espera após: %2
Desligar após: %3</translation>
    </message>
</context>
<context>
    <name>SettingsListSelectionProgressItem</name>
    <message>
        <source>%1%</source>
        <translation>%1%</translation>
    </message>
    <message>
        <source>%1 of %2</source>
        <translation>%1 de %2</translation>
    </message>
</context>
<context>
    <name>SettingsListSelectionSliderItem</name>
    <message>
        <source>Never</source>
        <translation>Nunca</translation>
    </message>
</context>
<context>
    <name>SettingsMainPage</name>
    <message>
        <source>Settings</source>
        <translation>Configurações</translation>
    </message>
    <message>
        <source>Valid</source>
        <translation>Válida</translation>
    </message>
    <message>
        <source>Expired</source>
        <translation>Expirada</translation>
    </message>
    <message>
        <source>Not Connected</source>
        <translation>Não conectado</translation>
    </message>
    <message>
        <source>%1</source>
        <translation>%1</translation>
    </message>
    <message>
        <source>%1%</source>
        <translation>%1%</translation>
    </message>
    <message>
        <source>Power</source>
        <translation>Energia</translation>
    </message>
    <message>
        <source>Language</source>
        <translation>Idioma</translation>
    </message>
    <message>
        <source>Calibration</source>
        <translation>Calibração</translation>
    </message>
    <message>
        <source>Measurement Options</source>
        <translation>Opções de medição</translation>
    </message>
    <message>
        <source>Wi-Fi</source>
        <translation>Wi-Fi</translation>
    </message>
    <message>
        <source>Display Settings</source>
        <translation>Tela</translation>
    </message>
    <message>
        <source>Beeper Volume</source>
        <translation>Volume do bipe</translation>
    </message>
    <message>
        <source>Power Saving Options</source>
        <translation>Economia de energia</translation>
    </message>
    <message>
        <source>System &amp; Diagnostics</source>
        <translation>Sistema e diagnóstico</translation>
    </message>
</context>
<context>
    <name>SettingsMeasurementPage</name>
    <message>
        <source>On</source>
        <translation>Ligado</translation>
    </message>
    <message>
        <source>Off</source>
        <translation>Desligado</translation>
    </message>
    <message>
        <source>Measurement Options</source>
        <translation>Opções de medição</translation>
    </message>
    <message>
        <source>Auto Measurement</source>
        <translation>Medição automática</translation>
    </message>
    <message>
        <source>Time to start auto measurement (sec):</source>
        <translation>Tempo até a medição automática (s):</translation>
    </message>
    <message>
        <source>Measurement Mode</source>
        <translation>Modo de medição</translation>
    </message>
    <message>
        <source>No. of good measurements required:</source>
        <translation>N.º de medições válidas necessárias:</translation>
    </message>
    <message>
        <source>Maximum measurements:</source>
        <translation>Máximo de medições:</translation>
    </message>
    <message>
        <source>Auto Measurements: %1</source>
        <translation>Medições automáticas: %1</translation>
    </message>
    <message>
        <source>Display LABCH: %1</source>
        <translation>Mostrar LABCH: %1</translation>
    </message>
    <message>
        <source>Override Pressure Sensors: %1</source>
        <translation>Ignorar sensores de pressão: %1</translation>
    </message>
</context>
<context>
    <name>SettingsPowerOptionsPage</name>
    <message>
        <source>Power Saving
Options</source>
        <translation>Economia
de energia</translation>
    </message>
    <message>
        <source>Dim Display</source>
        <translation>Escurecer tela</translation>
    </message>
    <message>
        <source>Standby Mode</source>
        <translation>Modo de espera</translation>
    </message>
    <message>
        <source>Power Off</source>
        <translation>Desligar</translation>
    </message>
    <message>
        <source>Seconds until display dims:</source>
        <translation>Segundos até escurecer a tela:</translation>
    </message>
    <message>
        <source>Minutes until standby mode:</source>
        <translation>Minutos até o modo de espera:</translation>
    </message>
    <message>
        <source>Minutes until power off:</source>
        <translation>Minutos até desligar:</translation>
    </message>
</context>
<context>
    <name>SettingsPowerPage</name>
    <message>
        <source>Power</source>
        <translation>Energia</translation>
    </message>
    <message>
        <source>Power Off</source>
        <translation>Desligar</translation>
    </message>
    <message>
        <source>Reboot</source>
        <translation>Reiniciar</translation>
    </message>
    <message>
        <source>Shutdown Instrument?</source>
        <translation>Desligar o instrumento?</translation>
    </message>
    <message>
        <source>Are you sure you want to shutdown the instrument?</source>
        <translation>Tem certeza de que deseja desligar o instrumento?</translation>
    </message>
    <message>
        <source>Enter Standby Mode?</source>
        <translation>Entrar em espera?</translation>
    </message>
    <message>
        <source>Are you sure you want to put the instrument into standby mode?</source>
        <translation>Tem certeza de que deseja colocar o instrumento em espera?</translation>
    </message>
    <message>
        <source>Reboot Instrument?</source>
        <translation>Reiniciar o instrumento?</translation>
    </message>
    <message>
        <source>Are you sure you want to reboot the instrument?</source>
        <translation>Tem certeza de que deseja reiniciar o instrumento?</translation>
    </message>
    <message>
        <source>Yes</source>
        <translation>Sim</translation>
    </message>
    <message>
        <source>No</source>
        <translation>Não</translation>
    </message>
</context>
<context>
    <name>SettingsSystemAndDiagnosticsPage</name>
    <message>
        <source>System &amp;
Diagnostics</source>
        <translation>Sistema e
diagnóstico</translation>
    </message>
    <message>
        <source>System Information</source>
        <translation>Informações do sistema</translation>
    </message>
    <message>
        <source>Database / Memory</source>
        <translation>Banco de dados / memória</translation>
    </message>
    <message>
        <source>Legal Information</source>
        <translation>Informações legais</translation>
    </message>
    <message>
        <source>Self Test</source>
        <translation>Autoteste</translation>
    </message>
</context>
<context>
    <name>SettingsSystemInformationPage</name>
    <message>
        <source>System Information</source>
        <translation>Informações do sistema</translation>
    </message>
    <message>
        <source>Not Configured</source>
        <translation>Não configurado</translation>
    </message>
    <message>
        <source>Instrument Model:</source>
        <translation>Modelo:</translation>
    </message>
    <message>
        <source>Instrument Serial:</source>
        <translation>N.º de série:</translation>
    </message>
    <message>
        <source>Part Number:</source>
        <translation>Código da peça:</translation>
    </message>
    <message>
        <source>White Reference Tile:</source>
        <translation>Padrão branco:</translation>
    </message>
    <message>
        <source>Certification Date:</source>
        <translation>Data de certificação:</translation>
    </message>
    <message>
        <source>Firmware Revision:</source>
        <translation>Versão do firmware:</translation>
    </message>
    <message>
        <source>Interface Revision:</source>
        <translation>Versão da interface:</translation>
    </message>
    <message>
        <source>Kernel:</source>
        <translation>Kernel:</translation>
    </message>
    <message>
        <source>Bootloader:</source>
        <translation>Bootloader:</translation>
    </message>
    <message>
        <source>Server URL:</source>
        <translation>URL do servidor:</translation>
    </message>
    <message>
        <source>Restore Factory Settings</source>
        <translation>Restaurar configurações de fábrica</translation>
    </message>
    <message>
        <source>Open Source</source>
        <translation>Código aberto</translation>
    </message>
    <message>
        <source>Burn in BIRCH JuniperX/Juniper</source>
        <translation>Burn in BIRCH JuniperX/Juniper</translation>
    </message>
    <message>
        <source>Burn in ALDER Larch</source>
        <translation>Burn in ALDER Larch</translation>
    </message>
    <message>
        <source>Burn in Spruce / Sequoia</source>
        <translation>Burn in Spruce / Sequoia</translation>
    </message>
</context>
<context>
    <name>SettingsVolumePage</name>
    <message>
        <source>Beeper Volume</source>
        <translation>Volume do bipe</translation>
    </message>
</context>
<context>
    <name>SettingsWifiPage</name>
    <message>
        <source>Wi-Fi</source>
        <translation>Wi-Fi</translation>
    </message>
    <message>
        <source>On</source>
        <translation>Ligado</translation>
    </message>
    <message>
        <source>Off</source>
        <translation>Desligado</translation>
    </message>
    <message>
        <source>Static IP</source>
        <translation>IP estático</translation>
    </message>
    <message>
        <source>DHCP</source>
        <translation>DHCP</translation>
    </message>
    <message>
        <source>Known Networks</source>
        <translation>Redes conhecidas</translation>
    </message>
    <message>
        <source>Unknown Networks</source>
        <translation>Redes disponíveis</translation>
    </message>
    <message>
        <source>Connection Issue</source>
        <translation>Problema de conexão</translation>
    </message>
    <message>
        <source>Incorrect password</source>
        <translation>Senha incorreta</translation>
    </message>
    <message>
        <source>Network not in range</source>
        <translation>Rede fora de alcance</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>OK</translation>
    </message>
</context>
<context>
    <name>StringTables</name>
    <message>
        <source>English</source>
        <translation>Inglês</translation>
    </message>
    <message>
        <source>Spanish</source>
        <translation>Espanhol</translation>
    </message>
    <message>
        <source>French</source>
        <translation>Francês</translation>
    </message>
    <message>
        <source>German</source>
        <translation>Alemão</translation>
    </message>
    <message>
        <source>Italian</source>
        <translation>Italiano</translation>
    </message>
    <message>
        <source>Portuguese</source>
        <translation>Português</translation>
    </message>
    <message>
        <source>Japanese</source>
        <translation>Japonês</translation>
    </message>
    <message>
        <source>Korean</source>
        <translation>Coreano</translation>
    </message>
    <message>
        <source>Chinese Simplified</source>
        <translation>Chinês simplificado</translation>
    </message>
    <message>
        <source>Custom</source>
        <translation>Personalizado</translation>
    </message>
    <message>
        <source>-45%1</source>
        <translation>-45%1</translation>
    </message>
    <message>
        <source>-15%1</source>
        <translation>-15%1</translation>
    </message>
    <message>
        <source>15%1</source>
        <translation>15%1</translation>
    </message>
    <message>
        <source>45%1</source>
        <translation>45%1</translation>
    </message>
    <message>
        <source>80%1</source>
        <translation>80%1</translation>
    </message>
    <message>
        <source>Diffuse</source>
        <translation>Difusa</translation>
    </message>
    <message>
        <source>25%1</source>
        <translation>25%1</translation>
    </message>
    <message>
        <source>75%1</source>
        <translation>75%1</translation>
    </message>
    <message>
        <source>110%1</source>
        <translation>110%1</translation>
    </message>
    <message>
        <source>A/2%1</source>
        <translation>A/2%1</translation>
    </message>
    <message>
        <source>A/10%1</source>
        <translation>A/10%1</translation>
    </message>
    <message>
        <source>C/2%1</source>
        <translation>C/2%1</translation>
    </message>
    <message>
        <source>C/10%1</source>
        <translation>C/10%1</translation>
    </message>
    <message>
        <source>D50/2%1</source>
        <translation>D50/2%1</translation>
    </message>
    <message>
        <source>D50/10%1</source>
        <translation>D50/10%1</translation>
    </message>
    <message>
        <source>D55/2%1</source>
        <translation>D55/2%1</translation>
    </message>
    <message>
        <source>D55/10%1</source>
        <translation>D55/10%1</translation>
    </message>
    <message>
        <source>D65/2%1</source>
        <translation>D65/2%1</translation>
    </message>
    <message>
        <source>D65/10%1</source>
        <translation>D65/10%1</translation>
    </message>
    <message>
        <source>D75/2%1</source>
        <translation>D75/2%1</translation>
    </message>
    <message>
        <source>D75/10%1</source>
        <translation>D75/10%1</translation>
    </message>
    <message>
        <source>F2/2%1</source>
        <translation>F2/2%1</translation>
    </message>
    <message>
        <source>F2/10%1</source>
        <translation>F2/10%1</translation>
    </message>
    <message>
        <source>F7/2%1</source>
        <translation>F7/2%1</translation>
    </message>
    <message>
        <source>F7/10%1</source>
        <translation>F7/10%1</translation>
    </message>
    <message>
        <source>F8/2%1</source>
        <translation>F8/2%1</translation>
    </message>
    <message>
        <source>F8/10%1</source>
        <translation>F8/10%1</translation>
    </message>
    <message>
        <source>F10/2%1</source>
        <translation>F10/2%1</translation>
    </message>
    <message>
        <source>F10/10%1</source>
        <translation>F10/10%1</translation>
    </message>
    <message>
        <source>F11/2%1</source>
        <translation>F11/2%1</translation>
    </message>
    <message>
        <source>F11/10%1</source>
        <translation>F11/10%1</translation>
    </message>
    <message>
        <source>F12/2%1</source>
        <translation>F12/2%1</translation>
    </message>
    <message>
        <source>F12/10%1</source>
        <translation>F12/10%1</translation>
    </message>
    <message>
        <source>Mid Tier</source>
        <translation>Gama média</translation>
    </message>
    <message>
        <source>ALDER</source>
        <translation>ALDER</translation>
    </message>
    <message>
        <source>BIRCH</source>
        <translation>BIRCH</translation>
    </message>
    <message>
        <source>QC</source>
        <translation>QC</translation>
    </message>
    <message>
        <source>No Averaging</source>
        <translation>Sem média</translation>
    </message>
    <message>
        <source>Averaging 3</source>
        <translation>Média 3</translation>
    </message>
    <message>
        <source>Averaging 5</source>
        <translation>Média 5</translation>
    </message>
    <message>
        <source>SMC m:n</source>
        <translation>SMC m:n</translation>
    </message>
    <message>
        <source>White Tile</source>
        <translation>Padrão branco</translation>
    </message>
    <message>
        <source>Reference Tile</source>
        <translation>Padrão de referência</translation>
    </message>
    <message>
        <source>Lifted</source>
        <translation>Levantado</translation>
    </message>
    <message>
        <source>White Tile Complete</source>
        <translation>Padrão branco concluído</translation>
    </message>
    <message>
        <source>Reference Tile Complete</source>
        <translation>Padrão de referência concluído</translation>
    </message>
    <message>
        <source>Lifted Complete</source>
        <translation>Levantado concluído</translation>
    </message>
</context>
<context>
    <name>SyncScreen</name>
    <message>
        <source>Syncing Job Data</source>
        <translation>A sincronizar dados dos trabalhos</translation>
    </message>
</context>
<context>
    <name>TargetingScreen</name>
    <message>
        <source>Job</source>
        <translation>Trabalho</translation>
    </message>
    <message>
        <source>Press button to measure.</source>
        <translation>Prima o botão para medir.</translation>
    </message>
    <message>
        <source>Targeting</source>
        <translation>Posicionamento</translation>
    </message>
    <message>
        <source>Averaged 0 of SMC 0:0</source>
        <translation>Média de 0 de SMC 0:0</translation>
    </message>
    <message>
        <source>Measure</source>
        <translation>Medir</translation>
    </message>
    <message>
        <source>Terminate</source>
        <translation>Terminar</translation>
    </message>
    <message>
        <source>Online Mode</source>
        <translation>Modo online</translation>
    </message>
    <message>
        <source>Averaged %1 of SMC %2:%3</source>
        <translation>Média de %1 de SMC %2:%3</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>OK</translation>
    </message>
    <message>
        <source>Exit Online Mode?</source>
        <translation>Sair do modo online?</translation>
    </message>
    <message>
        <source>Exiting online mode will stop targeting and return to the job list.</source>
        <translation>Sair do modo online interrompe o posicionamento e volta à lista de trabalhos.</translation>
    </message>
    <message>
        <source>Exit</source>
        <translation>Sair</translation>
    </message>
    <message>
        <source>Stop Measuring?</source>
        <translation>Parar de medir?</translation>
    </message>
    <message>
        <source>All measured samples and this job will be permanently deleted.</source>
        <translation>Todas as amostras medidas e este trabalho serão eliminados permanentemente.</translation>
    </message>
    <message>
        <source>All measured samples from this job will be permanently deleted.</source>
        <translation>Todas as amostras medidas deste trabalho serão eliminadas permanentemente.</translation>
    </message>
    <message>
        <source>Warning</source>
        <translation>Aviso</translation>
    </message>
    <message>
        <source>Continue</source>
        <translation>Continuar</translation>
    </message>
    <message>
        <source>Temperature out of range.  Continue online mode until complete, or Exit online mode and return to the job list?</source>
        <translation>Temperatura fora do intervalo. Continuar no modo online até ao fim, ou sair do modo online e voltar à lista de trabalhos?</translation>
    </message>
    <message>
        <source>Temperature out of range.  Continue job until complete, or delete job and all samples and return to the job list?</source>
        <translation>Temperatura fora do intervalo. Continuar o trabalho até ao fim, ou eliminar o trabalho e todas as amostras e voltar à lista?</translation>
    </message>
    <message>
        <source>Temperature out of range.  Continue job until complete, or delete all samples and return to the job list?</source>
        <translation>Temperatura fora do intervalo. Continuar o trabalho até ao fim, ou eliminar todas as amostras e voltar à lista?</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Eliminar</translation>
    </message>
    <message>
        <source>Override Pressure Sensors?</source>
        <translation>Ignorar os sensores de pressão?</translation>
    </message>
    <message>
        <source>Not all pressure sensors are active. Press the measure button again to start a measurement, otherwise press the cancel button to return to targeting mode.</source>
        <translation>Nem todos os sensores de pressão estão ativos. Prima novamente o botão de medição para medir, ou Cancelar para voltar ao posicionamento.</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Cancelar</translation>
    </message>
    <message>
        <source>Information</source>
        <translation>Informação</translation>
    </message>
    <message>
        <source>Not all pressure sensors are active. Please ensure all pressure sensors are active before measuring</source>
        <translation>Nem todos os sensores de pressão estão ativos. Certifique-se de que estão todos ativos antes de medir</translation>
    </message>
    <message>
        <source>Continue Measuring?</source>
        <translation>Continuar a medir?</translation>
    </message>
    <message>
        <source>To continue with measurements, press OK</source>
        <translation>Para continuar as medições, prima OK</translation>
    </message>
    <message>
        <source>Job Time Elapsed</source>
        <translation>Tempo do trabalho esgotado</translation>
    </message>
    <message>
        <source>The job wasn&apos;t completed within the allocated time</source>
        <translation>O trabalho não foi concluído no tempo previsto</translation>
    </message>
    <message>
        <source>SMC force finished, all readings averaged for result.</source>
        <translation>SMC terminado à força; todas as leituras foram calculadas em média para o resultado.</translation>
    </message>
    <message>
        <source>Maximum number of SMC measurements used for this job</source>
        <translation>Foi usado o número máximo de medições SMC deste trabalho</translation>
    </message>
    <message>
        <source>Complete</source>
        <translation>Concluído</translation>
    </message>
    <message>
        <source>The job has completed.  Press OK to exit online mode</source>
        <translation>O trabalho foi concluído. Prima OK para sair do modo online</translation>
    </message>
    <message>
        <source>SMC force finished, all readings averaged for result.  Press OK to exit online mode</source>
        <translation>SMC terminado à força; leituras calculadas em média. Prima OK para sair do modo online</translation>
    </message>
    <message>
        <source>SMC failed after maximum measurements %1, the final results are averaged.  Press OK to exit online mode</source>
        <translation>SMC falhou após o máximo de %1 medições; o resultado final é a média. Prima OK para sair do modo online</translation>
    </message>
</context>
<context>
    <name>TerminateJobPopup</name>
    <message>
        <source>Store Average</source>
        <translation>Guardar média</translation>
    </message>
    <message>
        <source>Restart Job</source>
        <translation>Reiniciar trabalho</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Cancelar</translation>
    </message>
</context>
<context>
    <name>UndoPopup</name>
    <message>
        <source>Undo</source>
        <translation>Anular</translation>
    </message>
    <message>
        <source>Back</source>
        <translation>Voltar</translation>
    </message>
</context>
<context>
    <name>WebSyncButton</name>
    <message>
        <source>Send All Jobs To Server</source>
        <translation>Enviar todos os trabalhos para o servidor</translation>
    </message>
</context>
<context>
    <name>WifiPasswordScreen</name>
    <message>
        <source>Password</source>
        <translation>Senha</translation>
    </message>
    <message>
        <source>ABC</source>
        <translation>ABC</translation>
    </message>
    <message>
        <source>@&amp;*</source>
        <translation>@&amp;*</translation>
    </message>
</context>
</TS>
