# The command-line tool on the bundled example statement: what the README's first command prints.
add_test(NAME tool_transactions COMMAND oesdk-cli transactions ${PROJECT_SOURCE_DIR}/examples/statement.ofx)
set_tests_properties(tool_transactions PROPERTIES PASS_REGULAR_EXPRESSION
  "4412907731,bank,20240109,CHECK,-120.00,202401090002,City Water & Sewer,,1042")
add_test(NAME tool_check COMMAND oesdk-cli check ${PROJECT_SOURCE_DIR}/examples/statement.ofx)
add_test(NAME tool_request COMMAND oesdk-cli request statement --bank-id 011000138 --account 4412907731
  --type CHECKING --from 20240101 --user u --password p --trnuid T1)
set_tests_properties(tool_request PROPERTIES PASS_REGULAR_EXPRESSION "<STMTRQ>\r?\n<BANKACCTFROM>\r?\n<BANKID>011000138")
