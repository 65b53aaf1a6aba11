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
        <source>Do not touch or bump instrument</source>
        <translation>Não toque nem bata no instrumento</translation>
    </message>
    <message>
        <source>Calibrating</source>
        <translation>Calibrando</translation>
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
        <translation>Toque no botão Autoteste para iniciá-lo</translation>
    </message>
    <message>
        <source>Self Test</source>
        <translation>Autoteste</translation>
    </message>
    <message>
        <source>Calibrate your instrument by using the white reference tile included with your instrument.</source>
        <translation>Calibre o instrumento com a placa de referência branca fornecida.</translation>
    </message>
    <message>
        <source>Serial Number: %1</source>
        <translation>Número de série: %1</translation>
    </message>
    <message>
        <source>Place the instrument on the white calibration tile by aligning the white line on the desired reference.</source>
        <translation>Coloque o instrumento sobre a placa de calibração branca alinhando a linha branca com a referência.</translation>
    </message>
    <message>
        <source>Verify your instrument by using the effect reference tile included with your instrument. Serial Number: %1</source>
        <translation>Verifique o instrumento com a placa de referência de efeito fornecida. Número de série: %1</translation>
    </message>
    <message>
        <source>Place the instrument on the effect reference tile by aligning the white line on the desired reference</source>
        <translation>Coloque o instrumento sobre a placa de referência de efeito alinhando a linha branca com a referência</translation>
    </message>
    <message>
        <source>Self test your instrument by using the white reference tile included with your instrument. Serial Number: %1</source>
        <translation>Faça o autoteste com a placa de referência branca fornecida. Número de série: %1</translation>
    </message>
    <message>
        <source>Place the instrument on the white reference tile by aligning the white line on the desired reference</source>
        <translation>Coloque o instrumento sobre a placa de referência branca alinhando a linha branca com a referência</translation>
    </message>
    <message>
        <source>Self test your instrument by using the effect reference tile included with your instrument. Serial Number: %1</source>
        <translation>Faça o autoteste com a placa de referência de efeito fornecida. Número de série: %1</translation>
    </message>
    <message>
        <source>Self test your instrument by lifting the instrument into open air (not placed on anything)</source>
        <translation>Faça o autoteste com o instrumento levantado no ar (sem apoiá-lo em nada)</translation>
    </message>
</context>
<context>
    <name>CalibrationWizardScreen</name>
    <message>
        <source>Calibration</source>
        <translation>Calibração</translation>
    </message>
    <message>
        <source>Reference Tile Check</source>
        <translation>Verificação da placa de referência</translation>
    </message>
    <message>
        <source>Self Test %1: %2</source>
        <translation>Autoteste %1: %2</translation>
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
</TS>
